#pragma once

#include <string_view>

namespace ax::reader {

// The screen that a category speaks for: "Workout detail". "Every screen" for one that is not known, and for
// the empty name, which stands for the bundle as a whole.
std::string_view screenOfCategory(std::string_view category);

}  // namespace ax::reader
