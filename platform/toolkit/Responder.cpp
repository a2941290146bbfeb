#include "platform/toolkit/Responder.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

using Properties = AccessibilityProperties;

// A copy of the block, which may put another in its own place while it runs.
template <class Block>
Block blockIn(const Properties* properties, Block Properties::Blocks::*block) {
  return properties == nullptr || !properties->blocks ? Block() : (*properties->blocks).*block;
}

void setIsElement(Object& self, bool isElement) {
  Properties::of(self).isElement = isElement;
}
void setValue(Object& self, Ref<String> value) {
  Properties::of(self).value = std::move(value);
}
void setHint(Object& self, Ref<String> hint) {
  Properties::of(self).hint = std::move(hint);
}
void setTraits(Object& self, Traits traits) {
  Properties::of(self).traits = traits;
}
void setFrame(Object& self, Rect frame) {
  Properties& properties = Properties::of(self);
  properties.frame = frame;
  properties.frameInContainerSpace.reset();
}
void setElements(Object& self, Ref<Array> elements) {
  Properties::of(self).elements = std::move(elements);
}
void setContainer(Object& self, Ref<Object> container) {
  Properties::of(self).container = container;
}
void setActivationPoint(Object& self, Point point) {
  Properties::of(self).activationPoint = point;
}

std::int64_t noContainerType(Object&) {
  return 0;
}
Ref<Object> noPath(Object&) {
  return nullptr;
}
bool isNotModal(Object&) {
  return false;
}
void doNothing(Object&) {}
std::int64_t noExpandedStatus(Object&) {
  return 0;
}

}  // namespace

Class& Responder::staticClass() {
  static Class& result =
      ClassBuilder<Responder>("Responder", Object::staticClass())
          .method<&Responder::isAccessibilityElement>("isAccessibilityElement")
          .method<&Responder::accessibilityLabel>("accessibilityLabel")
          .method<&Responder::accessibilityValue>("accessibilityValue")
          .method<&Responder::accessibilityHint>("accessibilityHint")
          .method<&Responder::accessibilityTraits>("accessibilityTraits")
          .method<&Responder::accessibilityFrame>("accessibilityFrame")
          .method<&Responder::accessibilityElements>("accessibilityElements")
          .method<&Responder::accessibilityContainer>("accessibilityContainer")
          .method<&Responder::accessibilityActivationPoint>("accessibilityActivationPoint")
          .method<&Responder::accessibilityUserDefinedLabel>("accessibilityUserDefinedLabel")
          .method<&Responder::accessibilityActivate>("accessibilityActivate")
          .method<&noContainerType>("accessibilityContainerType")
          .method<&noPath>("accessibilityPath")
          .method<&isNotModal>("accessibilityViewIsModal")
          .method<&doNothing>("accessibilityIncrement")
          .method<&doNothing>("accessibilityDecrement")
          .method<&noExpandedStatus>("_accessibilityExpandedStatus")
          .method<&doNothing>("_accessibilityLoadAccessibilityInformation")
          .method<&setIsElement>("setIsAccessibilityElement:")
          .method<&setLabel>("setAccessibilityLabel:")
          .method<&setValue>("setAccessibilityValue:")
          .method<&setHint>("setAccessibilityHint:")
          .method<&setTraits>("setAccessibilityTraits:")
          .method<&setFrame>("setAccessibilityFrame:")
          .method<&setElements>("setAccessibilityElements:")
          .method<&setContainer>("setAccessibilityContainer:")
          .method<&setActivationPoint>("setAccessibilityActivationPoint:")
          .build();
  return result;
}

bool Responder::isAccessibilityElement() {
  const Properties* properties = Properties::find(*this);
  if (properties == nullptr) return defaultIsElement();
  if (const auto block = blockIn(properties, &Properties::Blocks::isElement)) return block();
  return properties->isElement ? *properties->isElement : defaultIsElement();
}

Ref<String> Responder::accessibilityLabel() {
  const Properties* properties = Properties::find(*this);
  if (properties == nullptr) return defaultLabel();
  if (const auto block = blockIn(properties, &Properties::Blocks::label)) return block();
  return properties->label ? properties->label : defaultLabel();
}

Ref<String> Responder::accessibilityValue() {
  const Properties* properties = Properties::find(*this);
  if (properties == nullptr) return defaultValue();
  if (const auto block = blockIn(properties, &Properties::Blocks::value)) return block();
  return properties->value ? properties->value : defaultValue();
}

Ref<String> Responder::accessibilityHint() {
  const Properties* properties = Properties::find(*this);
  return properties == nullptr ? nullptr : properties->hint;
}

Traits Responder::accessibilityTraits() {
  const Properties* properties = Properties::find(*this);
  return properties != nullptr && properties->traits ? *properties->traits : defaultTraits();
}

Rect Responder::accessibilityFrame() {
  const Properties* properties = Properties::find(*this);
  if (properties == nullptr) return defaultFrame();
  if (properties->frameInContainerSpace) {
    const Ref<Responder> container = cast<Responder>(messages::accessibilityContainer(*this));
    return container ? container->screenRect(*properties->frameInContainerSpace)
                     : *properties->frameInContainerSpace;
  }
  return properties->frame ? *properties->frame : defaultFrame();
}

Ref<Array> Responder::accessibilityElements() {
  const Properties* properties = Properties::find(*this);
  return properties == nullptr ? nullptr : properties->elements;
}

Ref<Object> Responder::accessibilityContainer() {
  const Properties* properties = Properties::find(*this);
  if (properties != nullptr) {
    if (Ref<Object> container = properties->container.lock()) return container;
  }
  return defaultContainer();
}

Point Responder::accessibilityActivationPoint() {
  const Properties* properties = Properties::find(*this);
  if (properties != nullptr && properties->activationPoint) return *properties->activationPoint;
  return messages::accessibilityFrame(*this).center();
}

Ref<String> Responder::accessibilityUserDefinedLabel() {
  return labelThatWasSet(*this);
}

bool Responder::accessibilityActivate() {
  const auto block = blockIn(Properties::find(*this), &Properties::Blocks::activate);
  return block ? block() : activateByDefault();
}

static const RegisteredClass<Responder> registered;

}  // namespace ax
