#pragma once

#include <QAccessible>

#include "apps/view/model/Item.h"

namespace ax::view {

// What the desktop's screen readers call an item.
QAccessible::Role elementRole(const Item& item);
// How it stands, but for the focus.
QAccessible::State elementState(const Item& item);

}  // namespace ax::view
