#pragma once

#include "host/workouts/CHWorkoutDetailPaceTableViewCell.h"

namespace ax::host {

// One stretch of a workout; it counts from 1.
class CHWorkoutSplit : public Object {
 public:
  static Class& staticClass();

  std::int64_t index() const { return index_; }
  const Ref<Quantity>& distance() const { return distance_; }
  double duration() const { return duration_; }  // seconds

 private:
  std::int64_t index_ = 1;
  Ref<Quantity> distance_;
  double duration_ = 0;
};

// The row of one split: its number, its distance unless that is a whole kilometer or mile, and its pace.
class CHWorkoutDetailSplitTableViewCell : public CHWorkoutDetailPaceTableViewCell {
 public:
  static Class& staticClass();

  const Ref<CHWorkoutSplit>& split() const { return split_; }
  // Shows the split at once; nil leaves the row as it is.
  void setSplit(Ref<CHWorkoutSplit> split);
  void layoutSubviews() override;

 private:
  Ref<CHWorkoutSplit> split_;
};

}  // namespace ax::host
