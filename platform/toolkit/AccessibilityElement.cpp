#include "platform/toolkit/AccessibilityElement.h"

#include "platform/runtime/ClassBuilder.h"
#include "platform/toolkit/ElementTree.h"
#include "platform/toolkit/SpokenText.h"

namespace ax {

Class& AccessibilityElement::staticClass() {
  using T = AccessibilityElement;
  static Class& result =
      ClassBuilder<T>("AccessibilityElement", Responder::staticClass())
          .method<&T::setAccessibilityFrameInContainerSpace>("setAccessibilityFrameInContainerSpace:")
          .build();
  return result;
}

Ref<AccessibilityElement> AccessibilityElement::initWithAccessibilityContainer(Receiver container) {
  Ref<AccessibilityElement> element = make<AccessibilityElement>();
  AccessibilityProperties::of(*element).container = container.get();
  return element;
}

void AccessibilityElement::setAccessibilityFrameInContainerSpace(Rect frame) {
  AccessibilityProperties& properties = AccessibilityProperties::of(*this);
  properties.frameInContainerSpace = frame;
  properties.frame.reset();
}

std::optional<Rect> AccessibilityElement::accessibilityFrameInContainerSpace() const {
  const AccessibilityProperties* properties = AccessibilityProperties::find(*this);
  return properties == nullptr ? std::nullopt : properties->frameInContainerSpace;
}

Class& AggregateElement::staticClass() {
  static Class& result =
      ClassBuilder<AggregateElement>("AggregateElement", AccessibilityElement::staticClass())
          .method<&AggregateElement::representedElements>("representedElements")
          .build();
  return result;
}

AggregateElement::AggregateElement(Receiver container, Ref<Array> representedElements)
    : represented_(std::move(representedElements)) {
  AccessibilityProperties::of(*this).container = container.get();
}

Ref<AggregateElement> AggregateElement::initWithAccessibilityContainerRepresentedElements(
    Receiver container, Ref<Array> representedElements) {
  return make<AggregateElement>(container, std::move(representedElements));
}

Rect AggregateElement::defaultFrame() {
  return frameForElements(represented_);
}
Ref<String> AggregateElement::defaultLabel() {
  return labelForElements(represented_);
}

static const RegisteredClass<AccessibilityElement> registered;
static const RegisteredClass<AggregateElement> registeredAggregate;

}  // namespace ax
