#pragma once

#include <string>
#include <string_view>

namespace ax::reader {

// running, cycling, walking, hiking, swimming or yoga for the many ways in which files write it ("Biking",
// "TrailRun", "open_water_swimming"); "other" for what it does not know.
std::string sportNamed(std::string_view text);

}  // namespace ax::reader
