#include "host/charts/ActivityStandChartView.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& ActivityStandChartView::staticClass() {
  using T = ActivityStandChartView;
  static Class& result = ClassBuilder<T>("Velto.ActivityStandChartView", View::staticClass())
                             .property<&T::standChartPoints, &T::setStandChartPoints>("standChartPoints")
                             .build();
  return result;
}

static const RegisteredClass<ActivityStandChartView> registered;

}  // namespace ax::host
