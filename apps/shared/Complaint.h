#pragma once

#include <string>

namespace ax::app {

// One line to standard error, "axvelto: " before it: what is too long is cut, and what a terminal would obey
// stands as escapes.
void complain(const std::string& message);

}  // namespace ax::app
