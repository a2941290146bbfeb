#include "host/charts/ActivityMoveAndExerciseChartView.h"

#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Message.h"

namespace ax::host {

namespace {

const Message<void()> accessibilityReload{"accessibilityReloadData"};

}  // namespace

Class& ActivityMoveAndExerciseChartView::staticClass() {
  using T = ActivityMoveAndExerciseChartView;
  static Class& result =
      ClassBuilder<T>("Velto.ActivityMoveAndExerciseChartView", View::staticClass())
          .property<&T::moveAndExerciseChartPoints, &T::setMoveAndExerciseChartPoints>(
              "moveAndExerciseChartPoints")
          .property<&T::moveAndExerciseChartMaxYValue, &T::setMoveAndExerciseChartMaxYValue>(
              "moveAndExerciseChartMaxYValue")
          .property<&T::moveAndExerciseChartViewType, &T::setMoveAndExerciseChartViewType>(
              "moveAndExerciseChartViewType")
          .instanceVariable<&T::isDescriptionStale_>("_isDescriptionStale")
          .method<&T::reloadData>("reloadData")
          .method<&T::accessibilityReloadData>("accessibilityReloadData")
          .build();
  return result;
}

void ActivityMoveAndExerciseChartView::reloadData() {
  layoutSubviews();
  accessibilityReload(*this);
}

static const RegisteredClass<ActivityMoveAndExerciseChartView> registered;

}  // namespace ax::host
