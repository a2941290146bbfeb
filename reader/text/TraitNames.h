#pragma once

#include <string>
#include <vector>

#include "platform/toolkit/Traits.h"

namespace ax::reader {

// "button", "header", ...; bits without a name as "bit 9".
std::vector<std::string> traitNames(Traits traits);

}  // namespace ax::reader
