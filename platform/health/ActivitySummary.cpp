#include "platform/health/ActivitySummary.h"

#include <chrono>

#include "platform/runtime/ClassBuilder.h"

namespace ax {

Class& ActivitySummary::staticClass() {
  using T = ActivitySummary;
  static Class& result =
      ClassBuilder<T>("ActivitySummary", Object::staticClass())
          .instanceVariable<&T::move_>("move")
          .instanceVariable<&T::exercise_>("exercise")
          .instanceVariable<&T::stand_>("stand")
          .method<&T::_activeEnergyCompletionPercentage>("_activeEnergyCompletionPercentage")
          .method<&T::_exerciseTimeCompletionPercentage>("_exerciseTimeCompletionPercentage")
          .method<&T::_standHoursCompletionPercentage>("_standHoursCompletionPercentage")
          .build();
  return result;
}

void ActivitySummary::setFractions(double move, double exercise, double stand) {
  move_ = move;
  exercise_ = exercise;
  stand_ = stand;
}

Ref<DateComponents> activityCacheDateComponentsFromDate(const Ref<Date>& date,
                                                        const Ref<Calendar>& calendar) {
  return date && calendar ? calendar->componentsFromDate(*date) : nullptr;
}

std::int64_t cacheIndexFromDateComponents(const Ref<DateComponents>& components) {
  if (!components) return 0;
  const std::chrono::year_month_day day{std::chrono::year(components->year),
                                        std::chrono::month(static_cast<unsigned>(components->month)),
                                        std::chrono::day(static_cast<unsigned>(components->day))};
  return std::chrono::sys_days(day).time_since_epoch().count();
}

static const RegisteredClass<ActivitySummary> registered;

}  // namespace ax
