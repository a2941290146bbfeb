#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace ax::reader {

// The screens that a category speaks for, such as "Workout detail"; of the empty name those that rely on the
// checks of the bundle as a whole. None for a category that is not known.
std::vector<std::string> screensOfCategory(std::string_view category);

}  // namespace ax::reader
