#pragma once

#include "platform/health/Workout.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// A row with a pace, read as one element: that of the whole workout, or the speed of a ride. Rows of splits
// derive from it.
class CHWorkoutDetailPaceTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  void configureWithWorkoutDataCalculator(Ref<Workout> workout, Ref<Object> dataCalculator);

  const Ref<Workout>& workout() const { return workout_; }
  // Configures the row at once, with a calculator of the app's own.
  void setWorkout(Ref<Workout> workout);
  void layoutSubviews() override;

 protected:
  bool defaultIsElement() override { return true; }

  Ref<Label> unitLabel_;
  Ref<Label> distanceLabel_;
  Ref<Label> paceLabel_;

 private:
  Ref<Workout> workout_;
  Ref<Label> titleLabel_;
  Ref<Label> valueLabel_;
};

}  // namespace ax::host
