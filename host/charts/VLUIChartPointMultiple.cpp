#include "host/charts/VLUIChartPointMultiple.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& VLUIChartValueSpan::staticClass() {
  using T = VLUIChartValueSpan;
  static Class& result = ClassBuilder<T>("VLUIChartValueSpan", Object::staticClass())
                             .instanceVariable<&T::firstIndex_>("firstIndex")
                             .instanceVariable<&T::lastIndex_>("lastIndex")
                             .build();
  return result;
}

Class& VLUIChartPointMultiple::staticClass() {
  using T = VLUIChartPointMultiple;
  static Class& result = ClassBuilder<T>("VLUIChartPointMultiple", Object::staticClass())
                             .instanceVariable<&T::xValue_>("xValue")
                             .instanceVariable<&T::yValue_>("yValue")
                             .build();
  return result;
}

static const RegisteredClass<VLUIChartValueSpan> registeredSpan;
static const RegisteredClass<VLUIChartPointMultiple> registered;

}  // namespace ax::host
