#pragma once

#include "host/workouts/CHWorkoutSummaryTabbedLabelContainer.h"
#include "platform/foundation/Array.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// What all workouts of the list come to. Figures that they do not have are hidden.
class CHWorkoutsListSummaryTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  const Ref<Array>& workouts() const { return workouts_; }
  // Shows them at once.
  void setWorkouts(Ref<Array> workouts);
  void layoutSubviews() override;

 private:
  using Container = CHWorkoutSummaryTabbedLabelContainer;

  Ref<Array> workouts_;
  Ref<Container> numberOfWorkoutsLabel_;
  Ref<Container> activeEnergyLabel_;
  Ref<Container> durationLabel_;
  Ref<Container> distanceLabel_;
  Ref<Container> paceLabel_;
};

}  // namespace ax::host
