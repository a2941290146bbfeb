#include "host/charts/DayViewTitleAndValueLabelPair.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& DayViewTitleAndValueLabelPair::staticClass() {
  using T = DayViewTitleAndValueLabelPair;
  static Class& result = ClassBuilder<T>("Velto.DayViewTitleAndValueLabelPair", View::staticClass())
                             .property<&T::titleLabel, &T::setTitleLabel>("titleLabel")
                             .property<&T::valueLabel, &T::setValueLabel>("valueLabel")
                             .build();
  return result;
}

void DayViewTitleAndValueLabelPair::layoutSubviews() {
  stackIn(*this, {titleLabel_, valueLabel_});
}

static const RegisteredClass<DayViewTitleAndValueLabelPair> registered;

}  // namespace ax::host
