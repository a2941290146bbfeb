#include "bundle/shared/DayRings.h"

#include "bundle/shared/RingsDescription.h"
#include "platform/health/ActivitySummary.h"
#include "platform/runtime/KeyReading.h"
#include "platform/runtime/SafeMessage.h"

using namespace ax;

namespace {

constinit const Message<Ref<Object>(std::int64_t)> activitySummaryForCacheIndex{
    "activitySummaryForCacheIndex:"};
constinit const SafeMessage<double()> activeEnergyCompletionPercentage{"_activeEnergyCompletionPercentage"};
constinit const SafeMessage<double()> standHoursCompletionPercentage{"_standHoursCompletionPercentage"};

const Ref<Calendar>& gregorianCalendar() {
  static const auto& calendar =
      *new Ref<Calendar>(Calendar::calendarWithIdentifier(string(CalendarIdentifierGregorian)));
  return calendar;
}

double moveFraction(const Ref<ActivitySummary>& summary) {
  return activeEnergyCompletionPercentage(summary);
}
double exerciseFraction(const Ref<ActivitySummary>& summary) {
  return safeDoubleForKey(summary, "_exerciseTimeCompletionPercentage"_key);
}
double standFraction(const Ref<ActivitySummary>& summary) {
  return standHoursCompletionPercentage(summary);
}

bool isProgress(double fraction) {
  return fraction >= 0;
}

}  // namespace

std::int64_t CHCacheIndexForDate(const Ref<Date>& date) {
  return cacheIndexFromDateComponents(activityCacheDateComponentsFromDate(date, gregorianCalendar()));
}

Ref<String> accessibilityVeltoStringForDate(const Ref<Date>& date, bool arePercentagesCapped) {
  if (!date) return nullptr;
  Ref<Object> found;
  performSafeBlock([&] {
    const Ref<Object> cache =
        safeValueForKey(safeClassFromString("ActivitySummaryCache"_key), "sharedInstance"_key);
    found = activitySummaryForCacheIndex(cache, CHCacheIndexForDate(date));
  });
  const Ref<ActivitySummary> summary = castAsClass<ActivitySummary>(found);
  if (!isProgress(moveFraction(summary))) return nullptr;
  if (!isProgress(exerciseFraction(summary))) return nullptr;
  if (!isProgress(standFraction(summary))) return nullptr;
  const double move = moveFraction(summary);
  const double exercise = exerciseFraction(summary);
  const double stand = standFraction(summary);
  return messages::_veltoUIAccessibilityDescriptionForPercentages(summary, move, exercise, stand,
                                                                  arePercentagesCapped);
}
