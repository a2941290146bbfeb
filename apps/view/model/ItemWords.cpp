#include "apps/view/model/ItemWords.h"

#include "reader/speech/SpokenLine.h"

namespace ax::view {

using reader::Node;
using reader::Role;

namespace {

struct TraitsOfRole {
  Role role;
  Traits traits;
};

// Whether something is selected, readers tell of none of these; whether it is not available, only of what one
// operates.
constexpr TraitsOfRole traitsOfRoles[] = {{Role::header, TraitHeader},
                                          {Role::button, TraitButton | TraitNotEnabled},
                                          {Role::link, TraitLink | TraitNotEnabled},
                                          {Role::image, TraitImage},
                                          {Role::adjustable, TraitAdjustable | TraitNotEnabled}};

Traits traitsToldByRole(const Node& node) {
  for (const TraitsOfRole& row : traitsOfRoles) {
    if (node.role == row.role) return row.traits;
  }
  return 0;
}

// Readers speak the name of a group as they enter it, and what is in it says the same again.
void nameGroup(Item& item) {
  Node label;
  label.label = item.node.label;
  item.hint = reader::spokenLine(label);
}

}  // namespace

void nameItem(Item& item) {
  if (item.node.role == Role::container) return nameGroup(item);
  Node node = item.node;
  const bool isChart = node.series.has_value();
  if (isChart && !node.label) node.label = node.series->name;
  node.traits &= ~traitsToldByRole(node);
  // Charts that are something else first say so in their names.
  if (isChart && (node.role == Role::chart || node.role == Role::element)) node.series.reset();
  node.states = {.modal = item.opensModal};
  const std::string withHint = reader::spokenLine(node);
  node.hint.reset();
  item.name = reader::spokenLine(node);
  Node hint;
  hint.label = item.node.hint;
  item.hint = withHint == item.name ? std::string() : reader::spokenLine(hint);
}

std::string stateWords(const Item& item) {
  Node node;
  node.traits = item.node.traits & (TraitSelected | TraitNotEnabled);
  node.states = item.node.states;
  node.states.modal = false;
  return reader::spokenLine(node);
}

}  // namespace ax::view
