#include "apps/view/window/ElementRole.h"

namespace ax::view {

using reader::Role;

namespace {

struct RoleName {
  Role role;
  QAccessible::Role name;
};

constexpr RoleName roleNames[] = {
    {Role::container, QAccessible::Grouping}, {Role::chart, QAccessible::Chart},
    {Role::element, QAccessible::StaticText}, {Role::staticText, QAccessible::StaticText},
    {Role::image, QAccessible::Graphic},      {Role::link, QAccessible::Link},
    {Role::button, QAccessible::Button},      {Role::adjustable, QAccessible::Slider},
    {Role::header, QAccessible::Heading}};

}  // namespace

QAccessible::Role elementRole(const Item& item) {
  const reader::Node& node = item.node;
  if (node.states.modal) return QAccessible::Dialog;
  if (node.series && node.role == Role::element) return QAccessible::Chart;
  for (const RoleName& row : roleNames) {
    if (row.role == node.role) return row.name;
  }
  return QAccessible::StaticText;
}

QAccessible::State elementState(const Item& item) {
  const reader::States& states = item.node.states;
  QAccessible::State state;
  state.focusable = !item.line.empty();
  state.selectable = state.selected = states.selected;
  state.disabled = states.disabled;
  state.expandable = states.expanded || states.collapsed;
  state.expanded = states.expanded;
  state.collapsed = states.collapsed;
  state.modal = states.modal;
  return state;
}

}  // namespace ax::view
