#include "host/workouts/CHWorkoutDetailMapAndWeatherTableViewCell.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHWorkoutDetailMapAndWeatherTableViewCell::staticClass() {
  using T = CHWorkoutDetailMapAndWeatherTableViewCell;
  static Class& result =
      ClassBuilder<T>("CHWorkoutDetailMapAndWeatherTableViewCell", TableViewCell::staticClass())
          .instanceVariable<&T::mapView_>("_mapView")
          .instanceVariable<&T::weatherView_>("_weatherView")
          .build();
  return result;
}

void CHWorkoutDetailMapAndWeatherTableViewCell::layoutSubviews() {
  const std::initializer_list<Ref<View>> parts = {mapView_, weatherView_};
  for (const Ref<View>& part : parts) {
    if (part && part->superview() == nullptr) contentView()->addSubview(part);
  }
}

static const RegisteredClass<CHWorkoutDetailMapAndWeatherTableViewCell> registered;

}  // namespace ax::host
