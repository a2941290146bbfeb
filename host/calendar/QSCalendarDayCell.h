#pragma once

#include "platform/foundation/Date.h"
#include "platform/toolkit/Layer.h"

namespace ax::host {

// A day of a calendar, drawn as a layer. A day without a date stands for none.
class QSCalendarDayCell : public Layer {
 public:
  static Class& staticClass();

  const Ref<Date>& date() const { return date_; }
  void setDate(Ref<Date> date) { date_ = std::move(date); }
  bool representsToday();

 protected:
  // How many days from today: negative in the past.
  std::int64_t daysFromToday() const;

 private:
  Ref<Date> date_;
};

// A day of the month screen: its rings, and a mark when the user worked out.
class MonthDayCellLayer : public QSCalendarDayCell {
 public:
  static Class& staticClass();

  bool isFutureDay();

 private:
  bool hasWorkout_ = false;
};

}  // namespace ax::host
