#pragma once

#include "platform/foundation/Array.h"
#include "platform/toolkit/View.h"

namespace ax::host {

// The day's hours as columns, drawn high when the user stood in them: "Velto.ActivityStandChartView".
class ActivityStandChartView : public View {
 public:
  static Class& staticClass();

  // Boxed points, one per hour from left to right: x is the hour of the day, y above 0 for an hour with
  // standing.
  const Ref<Array>& standChartPoints() const { return points_; }
  void setStandChartPoints(Ref<Array> points) { points_ = std::move(points); }

 private:
  Ref<Array> points_;
};

}  // namespace ax::host
