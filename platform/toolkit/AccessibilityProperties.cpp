#include "platform/toolkit/AccessibilityProperties.h"

#include "platform/runtime/ClassBuilder.h"
#include "platform/toolkit/AccessibilityMessages.h"

namespace ax {

namespace {

AccessibilityProperties::Blocks* blocksOf(Receiver receiver) {
  if (receiver.get() == nullptr) return nullptr;
  auto& blocks = AccessibilityProperties::of(*receiver.get()).blocks;
  if (!blocks) blocks = std::make_unique<AccessibilityProperties::Blocks>();
  return blocks.get();
}

AccessibilityProperties* propertiesOf(Receiver receiver) {
  return receiver.get() == nullptr ? nullptr : &AccessibilityProperties::of(*receiver.get());
}

const AccessibilityProperties* findProperties(Receiver receiver) {
  return receiver.get() == nullptr ? nullptr : AccessibilityProperties::find(*receiver.get());
}

}  // namespace

const char AccessibilityProperties::key = 0;

Class& AccessibilityProperties::staticClass() {
  static Class& result = Class::add("AccessibilityProperties", &Object::staticClass(), nullptr);
  return result;
}

AccessibilityProperties& AccessibilityProperties::of(Object& object) {
  Object* properties = object.attached(&key);
  if (properties == nullptr) {
    object.attach(&key, make<AccessibilityProperties>());
    properties = object.attached(&key);
  }
  return *static_cast<AccessibilityProperties*>(properties);
}

Ref<String> labelThatWasSet(Object& object) {
  const auto* properties = AccessibilityProperties::find(object);
  return properties == nullptr ? nullptr : properties->label;
}

void setLabel(Object& object, Ref<String> label) {
  AccessibilityProperties::of(object).label = std::move(label);
}

void _accessibilityAddTrait(Receiver receiver, Traits bits) {
  messages::setAccessibilityTraits(receiver, messages::accessibilityTraits(receiver) | bits);
}

void _setAccessibilityLabelBlock(Receiver receiver, std::function<Ref<String>()> block) {
  if (auto* blocks = blocksOf(receiver)) blocks->label = std::move(block);
}
void _setAccessibilityValueBlock(Receiver receiver, std::function<Ref<String>()> block) {
  if (auto* blocks = blocksOf(receiver)) blocks->value = std::move(block);
}
void _setIsAccessibilityElementBlock(Receiver receiver, std::function<bool()> block) {
  if (auto* blocks = blocksOf(receiver)) blocks->isElement = std::move(block);
}
void _setAccessibilityActivateBlock(Receiver receiver, std::function<bool()> block) {
  if (auto* blocks = blocksOf(receiver)) blocks->activate = std::move(block);
}

void accessibilitySetIdentification(Receiver receiver, Ref<String> identification) {
  if (auto* properties = propertiesOf(receiver)) properties->identification = std::move(identification);
}

Ref<String> accessibilityIdentification(Receiver receiver) {
  const auto* properties = findProperties(receiver);
  return properties == nullptr ? nullptr : properties->identification;
}

void _accessibilitySetViewIsVisible(Receiver receiver, bool isVisible) {
  if (auto* properties = propertiesOf(receiver)) properties->isMarkedVisible = isVisible;
}

void _accessibilitySetOverridesInvisibility(Receiver receiver, bool overrides) {
  if (auto* properties = propertiesOf(receiver)) properties->overridesInvisibility = overrides;
}

void _accessibilitySetVisibleContentInset(Receiver receiver, Insets insets) {
  if (auto* properties = propertiesOf(receiver)) properties->visibleContentInset = insets;
}

Insets _accessibilityVisibleContentInset(Receiver receiver) {
  const auto* properties = findProperties(receiver);
  return properties == nullptr ? Insets() : properties->visibleContentInset.value_or(Insets());
}

}  // namespace ax
