#pragma once

#include <cstdint>

namespace ax {

// A chart that is told in slices has as many, whatever it shows.
inline constexpr std::uint64_t sliceCount = 8;

inline constexpr int hoursOfDay = 24;

}  // namespace ax
