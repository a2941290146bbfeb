#include "host/charts/DayViewStandChartTableViewCell.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& DayViewStandChartTableViewCell::staticClass() {
  using T = DayViewStandChartTableViewCell;
  static Class& result = ClassBuilder<T>("Velto.DayViewStandChartTableViewCell", TableViewCell::staticClass())
                             .instanceVariable<&T::titleAndValue_>("_titleAndValue")
                             .property<&T::chartView, &T::setChartView>("chartView")
                             .property<&T::idleHoursLabel, &T::setIdleHoursLabel>("idleHoursLabel")
                             .build();
  return result;
}

void DayViewStandChartTableViewCell::layoutSubviews() {
  stackIn(*contentView(), {titleAndValue_, chartView_, idleHoursLabel_});
}

static const RegisteredClass<DayViewStandChartTableViewCell> registered;

}  // namespace ax::host
