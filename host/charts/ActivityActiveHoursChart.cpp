#include "host/charts/ActivityActiveHoursChart.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& ActivityActiveHoursChart::staticClass() {
  using T = ActivityActiveHoursChart;
  static Class& result = ClassBuilder<T>("ActivityActiveHoursChart", View::staticClass())
                             .instanceVariable<&T::dataPoints_>("_dataPoints")
                             .instanceVariable<&T::barSeries_>("_barSeries")
                             .build();
  return result;
}

static const RegisteredClass<ActivityActiveHoursChart> registered;

}  // namespace ax::host
