#pragma once

#include "host/charts/VLUIChartUniformBarSeries.h"
#include "platform/foundation/Array.h"
#include "platform/toolkit/View.h"

namespace ax::host {

// The day's active hours as a uniform row of bars.
class ActivityActiveHoursChart : public View {
 public:
  static Class& staticClass();

 private:
  Ref<Array> dataPoints_;  // of VLUIChartPointNumeric, in any order
  Ref<VLUIChartUniformBarSeries> barSeries_;
};

}  // namespace ax::host
