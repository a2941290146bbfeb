#pragma once

#include "platform/foundation/Array.h"
#include "platform/runtime/Number.h"
#include "platform/toolkit/View.h"

namespace ax::host {

// The day's bars of move energy (0), move minutes (1) or exercise minutes (2):
// "Velto.ActivityMoveAndExerciseChartView".
class ActivityMoveAndExerciseChartView : public View {
 public:
  static Class& staticClass();

  // Boxed points from left to right: x is the hour of the day, y the amount.
  const Ref<Array>& moveAndExerciseChartPoints() const { return points_; }
  void setMoveAndExerciseChartPoints(Ref<Array> points) { points_ = std::move(points); }
  // The top of the vertical axis.
  const Ref<Number>& moveAndExerciseChartMaxYValue() const { return maxYValue_; }
  void setMoveAndExerciseChartMaxYValue(Ref<Number> value) { maxYValue_ = std::move(value); }
  std::int64_t moveAndExerciseChartViewType() const { return type_; }
  void setMoveAndExerciseChartViewType(std::int64_t type) { type_ = type; }

  // Draws the points anew and tells whoever describes the chart.
  void reloadData();
  // Called when the points have changed. By itself the view only notes that nobody has described them yet.
  void accessibilityReloadData() { isDescriptionStale_ = true; }

 private:
  Ref<Array> points_;
  Ref<Number> maxYValue_;
  std::int64_t type_ = 0;
  bool isDescriptionStale_ = false;
};

}  // namespace ax::host
