#pragma once

#include "platform/runtime/Object.h"

namespace ax {

// Names and explains the first right item of a controller's navigation bar that sends a message to a friend.
// Other items, and a controller without such a one, are left as they are.
void nameMessageButton(Object& controller);

}  // namespace ax
