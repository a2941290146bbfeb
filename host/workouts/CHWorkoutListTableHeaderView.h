#pragma once

#include "platform/foundation/Date.h"
#include "platform/toolkit/Label.h"

namespace ax::host {

// The header over the workouts of a month.
class CHWorkoutListTableHeaderView : public View {
 public:
  static Class& staticClass();

  const Ref<Date>& month() const { return month_; }
  // Any moment of the month.
  void setMonth(Ref<Date> month);
  std::int64_t numberOfWorkouts() const { return numberOfWorkouts_; }
  void setNumberOfWorkouts(std::int64_t number);
  void layoutSubviews() override;

 private:
  Ref<Date> month_;
  std::int64_t numberOfWorkouts_ = 0;
  Ref<Label> dateLabel_;
  Ref<Label> detailLabel_;
};

}  // namespace ax::host
