#include "reader/snapshot/NodeReading.h"

#include "platform/toolkit/Responder.h"

namespace ax::reader {

namespace {

struct RoleOfTrait {
  Traits trait;
  Role role;
};

// The first that an object has is its role.
constexpr RoleOfTrait rolesByTrait[] = {{TraitHeader, Role::header}, {TraitAdjustable, Role::adjustable},
                                        {TraitButton, Role::button}, {TraitLink, Role::link},
                                        {TraitImage, Role::image},   {TraitStaticText, Role::staticText}};

Role roleFor(Traits traits) {
  for (const RoleOfTrait& row : rolesByTrait) {
    if ((traits & row.trait) != 0) return row.role;
  }
  return Role::element;
}

States statesOf(Object& object, Traits traits, HostQuestions& questions) {
  const std::int64_t expansion = questions.ask(messages::_accessibilityExpandedStatus, object);
  return {.selected = (traits & TraitSelected) != 0,
          .disabled = (traits & TraitNotEnabled) != 0,
          .expanded = expansion == isExpanded,
          .collapsed = expansion == isCollapsed,
          .modal = questions.ask(messages::accessibilityViewIsModal, object)};
}

// Whether something below the toolkit's root answers the message.
template <class Type>
bool isSpecial(const Object& object, const Message<Type>& message) {
  const Method& method = object.isa().lookUp(message.selector());
  return method.function != nullptr && (method.owner != &Responder::staticClass() || method.graft != nullptr);
}

bool hasActivateBlock(const Object& object) {
  const AccessibilityProperties* properties = AccessibilityProperties::find(object);
  return properties != nullptr && properties->blocks && properties->blocks->activate;
}

Actions actionsOf(const Object& object, Traits traits) {
  if ((traits & TraitNotEnabled) != 0) return {};
  const bool isAdjustable = (traits & TraitAdjustable) != 0;
  return {.activate = (traits & (TraitButton | TraitLink)) != 0 || hasActivateBlock(object) ||
                      isSpecial(object, messages::accessibilityActivate),
          .increment = isAdjustable || isSpecial(object, messages::accessibilityIncrement),
          .decrement = isAdjustable || isSpecial(object, messages::accessibilityDecrement)};
}

}  // namespace

Node readNode(Object& object, HostQuestions& questions) {
  Node node;
  node.traits = questions.ask(messages::accessibilityTraits, object);
  node.role = roleFor(node.traits);
  node.label = questions.askText(messages::accessibilityLabel, object);
  node.value = questions.askText(messages::accessibilityValue, object);
  node.hint = questions.askText(messages::accessibilityHint, object);
  node.states = statesOf(object, node.traits, questions);
  node.frame = questions.ask(messages::accessibilityFrame, object);
  node.actions = actionsOf(object, node.traits);
  node.className = object.isa().name();
  return node;
}

}  // namespace ax::reader
