#pragma once

#include <cstddef>

namespace ax {

inline constexpr std::size_t daysOfWeek = 7;

}  // namespace ax
