#include "host/charts/VLUIChartPointNumeric.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& VLUIChartPointNumeric::staticClass() {
  using T = VLUIChartPointNumeric;
  static Class& result = ClassBuilder<T>("VLUIChartPointNumeric", Object::staticClass())
                             .property<&T::xValue, &T::setXValue>("xValue")
                             .property<&T::yValue, &T::setYValue>("yValue")
                             .build();
  return result;
}

static const RegisteredClass<VLUIChartPointNumeric> registered;

}  // namespace ax::host
