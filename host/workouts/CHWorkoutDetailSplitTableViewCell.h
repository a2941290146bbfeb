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
  // Of the workout that it belongs to.
  std::int64_t activityType() const { return activityType_; }
  // Whether it was a break between two efforts.
  bool isRest() const { return isRest_; }
  // Whether it is one length of a pool, and how it was swum; nil when that is not known.
  bool isLength() const { return isLength_; }
  const Ref<String>& stroke() const { return stroke_; }

 private:
  std::int64_t index_ = 1;
  std::int64_t activityType_ = 0;
  Ref<Quantity> distance_;
  Ref<String> stroke_;
  double duration_ = 0;
  bool isRest_ = false;
  bool isLength_ = false;
};

// The row of one split: its number and kind, its distance unless that is a whole kilometer or mile, and its
// pace, the speed of a ride, or its time where nobody went anywhere.
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
