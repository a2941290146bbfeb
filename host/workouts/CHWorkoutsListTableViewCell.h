#pragma once

#include "platform/health/Workout.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// One workout of the list: the icon of the app that recorded it, what it was, its figures and its day. Cells
// are reused: a cell may show many workouts one after another.
class CHWorkoutsListTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  const Ref<Workout>& workout() const { return workout_; }
  // Shows the workout at once.
  void setWorkout(Ref<Workout> workout);
  void layoutSubviews() override;

 private:
  void _configureWithCurrentWorkout();
  void showFigures();

  Ref<Workout> workout_;
  Ref<Label> titleLabel_;
  Ref<Label> durationLabel_;
  Ref<Label> distanceLabel_;
  Ref<Label> dateLabel_;
};

}  // namespace ax::host
