#pragma once

#include "platform/foundation/Calendar.h"

namespace ax {

// One day's rings, as fractions of the goals: 1.0 means reached.
class ActivitySummary final : public Object {
 public:
  static Class& staticClass();

  double _activeEnergyCompletionPercentage() const { return move_; }
  double _exerciseTimeCompletionPercentage() const { return exercise_; }
  double _standHoursCompletionPercentage() const { return stand_; }
  void setFractions(double move, double exercise, double stand);

 private:
  double move_ = 0;
  double exercise_ = 0;
  double stand_ = 0;
};

// The fields of a date that name an activity day, and the index of that day: days since 1970-01-01 of the
// local calendar day.
Ref<DateComponents> activityCacheDateComponentsFromDate(const Ref<Date>& date, const Ref<Calendar>& calendar);
std::int64_t cacheIndexFromDateComponents(const Ref<DateComponents>& components);

}  // namespace ax
