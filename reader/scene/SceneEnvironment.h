#pragma once

#include <optional>
#include <string>

#include "platform/foundation/Environment.h"

namespace ax::reader {

// The members of an environment that a scene gives, checked. What is absent stays as it is.
struct SceneEnvironment {
  std::optional<std::string> locale = {};
  std::optional<std::string> timeZone = {};
  std::optional<std::string> now = {};  // local in the time zone, or with an offset
  std::optional<bool> screenReader = {};
  std::optional<WheelchairUse> wheelchair = {};
  std::optional<std::string> firstName = {};
  std::optional<int> firstDayOfWeek = {};
  std::optional<std::string> energyUnit = {};
  std::optional<bool> checks = {};

  // Makes `base`, changed by these members, the environment of the process.
  void apply(Environment base) const;
};

}  // namespace ax::reader
