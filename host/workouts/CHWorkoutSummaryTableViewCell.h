#pragma once

#include "host/workouts/CHWorkoutSummaryTabbedLabelContainer.h"
#include "platform/foundation/Array.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// The summary on top of a workout's screen: what it was, and its figures. A session of several workouts shows
// their totals and averages.
class CHWorkoutSummaryTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  const Ref<Array>& workouts() const { return workouts_; }
  // Shows them at once.
  void setWorkouts(Ref<Array> workouts);
  void layoutSubviews() override;

 private:
  using Container = CHWorkoutSummaryTabbedLabelContainer;

  void _updateUI();

  Ref<Array> workouts_;
  Ref<Label> titleLabel_;
  Ref<Container> durationLabel_;
  Ref<Container> distanceLabel_;
  Ref<Container> activeEnergyLabel_;
};

}  // namespace ax::host
