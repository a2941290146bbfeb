#include "host/charts/VLUIChartUniformBarSeries.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& VLUIChartUniformBarSeries::staticClass() {
  using T = VLUIChartUniformBarSeries;
  static Class& result = ClassBuilder<T>("VLUIChartUniformBarSeries", Object::staticClass())
                             .instanceVariable<&T::minDate_>("_minDate")
                             .build();
  return result;
}

static const RegisteredClass<VLUIChartUniformBarSeries> registered;

}  // namespace ax::host
