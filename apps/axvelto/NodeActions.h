#pragma once

#include "apps/axvelto/Command.h"
#include "apps/shared/ShownScene.h"

namespace ax::app {

// Whether the command line wants something done with an element of the screen.
bool isNodeAction(const Arguments& arguments);

// Does it, and prints what is spoken then: the element as it stands now, a line for each notification, and
// the whole screen when more than the element changed. Throws a Fault for an element that there is not.
ExitCode runNodeAction(ShownScene& shown, const Arguments& arguments);

}  // namespace ax::app
