// Numbers as the current region writes them. NaN and infinities give the region's text for them.
// Everything rounds half away from zero, and nothing is ever "-0".
// Main thread only. Nothing here fails, except parsing.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace ax::formatting {

// At most `maximumFractionDigits` decimals (0 to 15, clamped), without trailing zeros, grouped.
std::string decimalString(double value, int maximumFractionDigits);

// Grouped: "1,234".
std::string integerString(std::int64_t value);

// The same without grouping: "1234", in the region's digits.
std::string plainIntegerString(std::int64_t value);

// Whole percent of a fraction: 1.0 gives "100%".
std::string percentString(double fraction);

// The number that the whole of `text` is, in the region's notation; ASCII digits always count as
// digits. Groups must be whole: "12,34" is nothing in English. Nothing for a number without end.
std::optional<double> parseNumber(std::string_view text);

}  // namespace ax::formatting
