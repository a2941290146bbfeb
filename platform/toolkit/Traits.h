#pragma once

#include <cstdint>

namespace ax {

// What an element is and what state it is in; combined by or.
using Traits = std::uint64_t;

inline constexpr Traits TraitButton = 1u << 0;
inline constexpr Traits TraitHeader = 1u << 1;
inline constexpr Traits TraitSelected = 1u << 2;
inline constexpr Traits TraitLink = 1u << 3;
inline constexpr Traits TraitImage = 1u << 4;
inline constexpr Traits TraitAdjustable = 1u << 5;
inline constexpr Traits TraitStaticText = 1u << 6;
inline constexpr Traits TraitNotEnabled = 1u << 7;

}  // namespace ax
