#include "host/workouts/CHWorkoutDetailMapView.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHWorkoutDetailMapView::staticClass() {
  using T = CHWorkoutDetailMapView;
  static Class& result = ClassBuilder<T>("CHWorkoutDetailMapView", View::staticClass())
                             .instanceVariable<&T::titleLabel_>("_titleLabel")
                             .build();
  return result;
}

Class& CHWorkoutDetailMapViewInCell::staticClass() {
  static Class& result = ClassBuilder<CHWorkoutDetailMapViewInCell>("_CHWorkoutDetailMapView",
                                                                    CHWorkoutDetailMapView::staticClass())
                             .build();
  return result;
}

void CHWorkoutDetailMapView::layoutSubviews() {
  ensure(routeView_);
  showIn(*this, routeView_, {0, 0, frame().width, frame().height});
  showIn(*this, titleLabel_, {0, 0, frame().width, std::min(frame().height, 30.0)});
}

static const RegisteredClass<CHWorkoutDetailMapView> registered;
static const RegisteredClass<CHWorkoutDetailMapViewInCell> registeredInCell;

}  // namespace ax::host
