#pragma once

#include "platform/toolkit/AccessibilityMessages.h"
#include "platform/toolkit/AccessibilityProperties.h"

namespace ax {

// The base of everything that accessibility can ask: views, layers, images, bar items, controllers and
// free-standing elements. It answers every accessibility property in one order of precedence: an override
// that a category grafted, then a block, then what was set, then the default of the class, which is one of
// the virtual functions below.
class Responder : public Object {
 public:
  static Class& staticClass();

  bool isAccessibilityElement();
  Ref<String> accessibilityLabel();
  Ref<String> accessibilityValue();
  Ref<String> accessibilityHint();
  Traits accessibilityTraits();
  Rect accessibilityFrame();  // in screen space
  Ref<Array> accessibilityElements();
  Ref<Object> accessibilityContainer();
  Point accessibilityActivationPoint();  // in screen space; the frame's center unless set
  Ref<String> accessibilityUserDefinedLabel();
  bool accessibilityActivate();

  // In screen space, of a rect in the object's own space.
  virtual Rect screenRect(Rect own) const { return own; }

 protected:
  virtual bool defaultIsElement() { return false; }
  virtual Ref<String> defaultLabel() { return nullptr; }
  virtual Ref<String> defaultValue() { return nullptr; }
  virtual Traits defaultTraits() { return 0; }
  virtual Rect defaultFrame() { return {}; }
  virtual Ref<Object> defaultContainer() { return nullptr; }
  virtual bool activateByDefault() { return false; }
};

}  // namespace ax
