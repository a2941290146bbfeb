#pragma once

#include "host/charts/VLUIChartView.h"
#include "platform/foundation/Array.h"
#include "platform/health/Workout.h"

namespace ax::host {

// The heart rate of a workout over its time. It draws the readings as one column per stretch of the workout,
// from the lowest to the highest reading in it.
class CHWorkoutDetailHeartRateChartView : public View {
 public:
  static Class& staticClass();

  bool hasAdequateDataForDisplay() const { return hasAdequateDataForDisplay_; }
  // Makes the points, the range and the chart view out of the readings, unless points have been set.
  void showReadings();
  void layoutSubviews() override;

 private:
  Ref<DateInterval> _dateInterval();  // nil for a workout without its two dates
  Ref<DateInterval> dateInterval();   // asks `_dateInterval`

  Ref<Array> heartRateReadings_;
  Ref<Array> heartRateChartPoints_;
  Ref<VLUIChartView> chartView_;
  Ref<Workout> workout_;
  bool hasAdequateDataForDisplay_ = false;
};

}  // namespace ax::host
