#pragma once

#include "platform/foundation/Array.h"
#include "platform/toolkit/Responder.h"

namespace ax {

// Under this name a view keeps the elements that were built for it.
inline constinit const LiteralSelector StorageKeyChildren{"StorageKeyChildren"};

// A free-standing element that stands for a part of a view: a bar of a chart, a day, a summary. The
// container that lists it owns it; the element knows its container weakly.
class AccessibilityElement : public Responder {
 public:
  static Class& staticClass();

  // With no container it stands in screen space.
  static Ref<AccessibilityElement> initWithAccessibilityContainer(Receiver container);

  // Converted to screen space at each query of the frame.
  void setAccessibilityFrameInContainerSpace(Rect frame);
  std::optional<Rect> accessibilityFrameInContainerSpace() const;

 protected:
  bool defaultIsElement() override { return true; }
};

// An element that stands for several others; its frame is theirs together.
class AggregateElement : public AccessibilityElement {
 public:
  static Class& staticClass();

  AggregateElement() = default;
  // What an init of a derived class passes on.
  AggregateElement(Receiver container, Ref<Array> representedElements);
  static Ref<AggregateElement> initWithAccessibilityContainerRepresentedElements(
      Receiver container, Ref<Array> representedElements);

  const Ref<Array>& representedElements() const { return represented_; }

 protected:
  Rect defaultFrame() override;
  Ref<String> defaultLabel() override;

 private:
  Ref<Array> represented_;
};

}  // namespace ax
