#include "host/workouts/CHWorkoutDetailMapView.h"

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
  if (titleLabel_ && titleLabel_->superview() == nullptr) addSubview(titleLabel_);
}

static const RegisteredClass<CHWorkoutDetailMapView> registered;
static const RegisteredClass<CHWorkoutDetailMapViewInCell> registeredInCell;

}  // namespace ax::host
