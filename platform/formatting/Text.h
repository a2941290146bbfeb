// Internal to this folder: conversions between the UTF-16 of the formatters and UTF-8.
#pragma once

#include <algorithm>
#include <cmath>
#include <string>
#include <string_view>

namespace ax::formatting {

std::string utf8From(std::u16string_view text);
std::u16string utf16From(std::string_view text);  // ill-formed bytes become U+FFFD

// The current locale's name with the Gregorian calendar, the one calendar used here.
std::string gregorianLocaleName();

// Times farther from 1970 than this, about 28,500 years, and NaN are not formatted.
constexpr double kFarthestTime = 9e11;
inline bool isFormattableTime(double seconds) {
  return std::abs(seconds) <= kFarthestTime;
}

// For arithmetic that must answer something: NaN counts as 0, what is too far as the limit.
inline double boundedTime(double seconds) {
  return std::isnan(seconds) ? 0 : std::clamp(seconds, -kFarthestTime, kFarthestTime);
}

}  // namespace ax::formatting
