#pragma once

#include "platform/foundation/String.h"

namespace ax {

// The weather library: short spoken descriptions of conditions.
class WeatherUtilities final : public Object {
 public:
  static Class& staticClass();
  static Ref<WeatherUtilities> sharedInstance();

  // For a code that names no condition: that it is unknown.
  Ref<String> descriptionForWeatherWXQConditionCode(std::int64_t code) const;
};

// The library's code for one of the host's older integer codes; -1 for one that it never used.
constexpr std::int64_t conditionCodeFromLegacyWeatherConditionCode(std::int64_t legacyCode) {
  constexpr std::int64_t firstLegacyCode = 1;
  constexpr std::int64_t conditions = 48;
  const bool isKnown = legacyCode >= firstLegacyCode && legacyCode - firstLegacyCode < conditions;
  return isKnown ? legacyCode - firstLegacyCode : -1;
}

}  // namespace ax
