#pragma once

#include <initializer_list>

#include "platform/toolkit/View.h"

namespace ax::host {

// Shows the parts in the parent, one below the other: a part without a superview is added, one without a
// frame gets an equal share of the height. Nil parts are left out.
void stackIn(View& parent, std::initializer_list<Ref<View>> parts);

}  // namespace ax::host
