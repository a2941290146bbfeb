#pragma once

#include <functional>
#include <optional>

#include "platform/foundation/Array.h"
#include "platform/foundation/String.h"
#include "platform/runtime/Geometry.h"
#include "platform/runtime/KeyReading.h"
#include "platform/runtime/Weak.h"
#include "platform/toolkit/Traits.h"

namespace ax {

// What has been set on one object from outside, made at the first setting. An absent one leaves the answer
// to the object's class.
class AccessibilityProperties final : public Object {
 public:
  static Class& staticClass();

  // The object's properties; made when there are none yet.
  static AccessibilityProperties& of(Object& object);
  // Null when nothing was ever set.
  static const AccessibilityProperties* find(const Object& object) {
    return static_cast<const AccessibilityProperties*>(object.attached(&key));
  }

  struct Blocks {
    std::function<Ref<String>()> label;
    std::function<Ref<String>()> value;
    std::function<bool()> isElement;
    std::function<bool()> activate;
  };

  Ref<String> label;
  Ref<String> value;
  Ref<String> hint;
  Ref<Array> elements;
  Ref<String> identification;
  Weak<Object> container;
  std::optional<Traits> traits;
  std::optional<bool> isElement;
  std::optional<Rect> frame;  // in screen space; setting one of the two takes the other away
  std::optional<Rect> frameInContainerSpace;
  std::optional<Point> activationPoint;  // in screen space
  std::optional<Insets> visibleContentInset;
  bool isMarkedVisible = false;
  bool overridesInvisibility = false;
  std::unique_ptr<Blocks> blocks;

 private:
  static const char key;
};

// The label that was set on an object; nil when none was.
Ref<String> labelThatWasSet(Object& object);
void setLabel(Object& object, Ref<String> label);

// Ors bits into the receiver's traits, overrides included.
void _accessibilityAddTrait(Receiver receiver, Traits bits);
// From now on the receiver's property is the block's result, computed at each query. The block must hold
// its objects weakly.
void _setAccessibilityLabelBlock(Receiver receiver, std::function<Ref<String>()> block);
void _setAccessibilityValueBlock(Receiver receiver, std::function<Ref<String>()> block);
void _setIsAccessibilityElementBlock(Receiver receiver, std::function<bool()> block);
// The receiver's activation runs the block; true means handled.
void _setAccessibilityActivateBlock(Receiver receiver, std::function<bool()> block);

// Tags the receiver with an identifying text, which is never spoken.
void accessibilitySetIdentification(Receiver receiver, Ref<String> identification);
Ref<String> accessibilityIdentification(Receiver receiver);
// Marks a view as visible for accessibility although the toolkit considers it hidden: it takes both.
void _accessibilitySetViewIsVisible(Receiver receiver, bool isVisible);
void _accessibilitySetOverridesInvisibility(Receiver receiver, bool overrides);
// What of a scroll view's content counts as visible when it scrolls for the screen reader.
void _accessibilitySetVisibleContentInset(Receiver receiver, Insets insets);
Insets _accessibilityVisibleContentInset(Receiver receiver);

}  // namespace ax
