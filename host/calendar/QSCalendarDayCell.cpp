#include "host/calendar/QSCalendarDayCell.h"

#include "platform/health/ActivitySummary.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

std::int64_t dayIndex(const Ref<Date>& date) {
  return cacheIndexFromDateComponents(activityCacheDateComponentsFromDate(date, Calendar::currentCalendar()));
}

}  // namespace

Class& QSCalendarDayCell::staticClass() {
  using T = QSCalendarDayCell;
  static Class& result = ClassBuilder<T>("QSCalendarDayCell", Layer::staticClass())
                             .property<&T::date, &T::setDate>("date")
                             .method<&T::representsToday>("representsToday")
                             .build();
  return result;
}

std::int64_t QSCalendarDayCell::daysFromToday() const {
  return dayIndex(date_) - dayIndex(Date::now());
}

bool QSCalendarDayCell::representsToday() {
  return date_ && daysFromToday() == 0;
}

Class& MonthDayCellLayer::staticClass() {
  using T = MonthDayCellLayer;
  static Class& result = ClassBuilder<T>("MonthDayCellLayer", QSCalendarDayCell::staticClass())
                             .instanceVariable<&T::hasWorkout_>("_hasWorkout")
                             .method<&T::isFutureDay>("isFutureDay")
                             .build();
  return result;
}

bool MonthDayCellLayer::isFutureDay() {
  return date() && daysFromToday() > 0;
}

static const RegisteredClass<QSCalendarDayCell> registered;
static const RegisteredClass<MonthDayCellLayer> registeredOfMonth;

}  // namespace ax::host
