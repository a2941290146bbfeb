#pragma once

#include <string>

#include "reader/text/Fault.h"

namespace ax::app {

// One line to standard error, "axvelto: " before it: what is too long is cut, and what a terminal would obey
// stands as escapes.
void complain(const std::string& message);
void complain(const reader::Fault& fault);

}  // namespace ax::app
