#pragma once

#include <initializer_list>

#include "platform/toolkit/View.h"

namespace ax::host {

// Puts the parts that stand nowhere yet into a view, in this order; nil ones are passed over. A layout pass
// may call it again and again.
void addUnplaced(View& parent, std::initializer_list<Ref<View>> parts);

}  // namespace ax::host
