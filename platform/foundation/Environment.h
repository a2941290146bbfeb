#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace ax {

// The health store's values for the user's wheelchair setting; `error` makes every query fail.
enum class WheelchairUse : std::int64_t { error = -1, unknown = 0, no = 1, yes = 2 };

// What the device tells everything that runs on it. Set from the main thread; `screenReader` and
// `wheelchair` may be read from any thread, through the functions below.
struct Environment {
  std::string locale = "en_US";
  std::string timeZone = "UTC";
  std::optional<double> now = {};  // seconds since 1970; the clock's time when absent
  bool screenReader = true;
  WheelchairUse wheelchair = WheelchairUse::unknown;
  std::string firstName = {};  // empty: not known
  int firstDayOfWeek = 2;      // of the weekly goals: 1 is Sunday
  std::string energyUnit = "kcal";
  bool checks = true;  // whether host contracts are checked at start-up
};

const Environment& environment();
void setEnvironment(Environment environment);

bool isScreenReaderRunning();
WheelchairUse storedWheelchairUse();
bool performValidationChecks();
int firstDayOfWeekForWeeklyGoalCalculations();

}  // namespace ax
