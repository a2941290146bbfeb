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
std::int64_t conditionCodeFromLegacyWeatherConditionCode(std::int64_t legacyCode);

}  // namespace ax
