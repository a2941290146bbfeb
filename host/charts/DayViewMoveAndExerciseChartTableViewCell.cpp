#include "host/charts/DayViewMoveAndExerciseChartTableViewCell.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& DayViewMoveAndExerciseChartTableViewCell::staticClass() {
  using T = DayViewMoveAndExerciseChartTableViewCell;
  static Class& result =
      ClassBuilder<T>("Velto.DayViewMoveAndExerciseChartTableViewCell", TableViewCell::staticClass())
          .property<&T::labelPair, &T::setLabelPair>("labelPair")
          .property<&T::chartView, &T::setChartView>("chartView")
          .property<&T::auxiliaryLabel, &T::setAuxiliaryLabel>("auxiliaryLabel")
          .build();
  return result;
}

void DayViewMoveAndExerciseChartTableViewCell::layoutSubviews() {
  stackIn(*contentView(), {labelPair_, chartView_, auxiliaryLabel_});
}

static const RegisteredClass<DayViewMoveAndExerciseChartTableViewCell> registered;

}  // namespace ax::host
