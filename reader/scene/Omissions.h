#pragma once

#include <string>

#include "reader/scene/Scene.h"

namespace ax::reader {

// Takes a class or a member away from the process's host, as if it had been renamed; for good. A member is
// taken from the class that declares it, which may stand above the one that is named. The name must have
// passed checkOmission().
void takeAway(const std::string& name);

}  // namespace ax::reader
