#include "host/charts/ActivityQuantityChart.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& ActivityQuantityChart::staticClass() {
  using T = ActivityQuantityChart;
  static Class& result = ClassBuilder<T>("ActivityQuantityChart", View::staticClass())
                             .instanceVariable<&T::dataPoints_>("_dataPoints")
                             .instanceVariable<&T::preferredUnit_>("_preferredUnit")
                             .build();
  return result;
}

static const RegisteredClass<ActivityQuantityChart> registered;

}  // namespace ax::host
