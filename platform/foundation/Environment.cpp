#include "platform/foundation/Environment.h"

#include <atomic>

#include "platform/formatting/Region.h"
#include "platform/runtime/MainThread.h"
#include "platform/runtime/Precondition.h"

namespace ax {

namespace {

std::atomic<bool> screenReader = true;
std::atomic<WheelchairUse> wheelchair = WheelchairUse::unknown;

Environment& current() {
  static auto* const environment = new Environment;
  return *environment;
}

}  // namespace

const Environment& environment() {
  return current();
}

void setEnvironment(Environment next) {
  precondition(isMainThread(), "the environment belongs to the main thread: set it there");
  const formatting::Region region{next.locale, next.timeZone};
  if (formatting::currentRegion() != region) formatting::setCurrentRegion(region);
  screenReader = next.screenReader;
  wheelchair = next.wheelchair;
  current() = std::move(next);
}

bool isScreenReaderRunning() {
  return screenReader;
}
WheelchairUse storedWheelchairUse() {
  return wheelchair;
}
bool performValidationChecks() {
  return current().checks;
}
int firstDayOfWeekForWeeklyGoalCalculations() {
  return current().firstDayOfWeek;
}

}  // namespace ax
