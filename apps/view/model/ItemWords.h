#pragma once

#include "apps/view/model/Item.h"

namespace ax::view {

// Fills in the item's name and hint from its node. A screen reader tells the role, most states and the hint
// in its own words; the name carries the label, the value and every other word of the spoken line. Groups
// have no name, and their labels as hints.
void nameItem(Item& item);

// How the item stands, in words: selected, not available, expanded, collapsed. Empty where there is nothing
// to tell.
std::string stateWords(const Item& item);

}  // namespace ax::view
