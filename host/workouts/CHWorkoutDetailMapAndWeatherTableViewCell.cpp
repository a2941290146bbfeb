#include "host/workouts/CHWorkoutDetailMapAndWeatherTableViewCell.h"

#include "host/core/Layout.h"
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
  const double mapHeight = frame().height * (weatherView_ ? 0.75 : 1);
  showIn(*contentView(), mapView_, {0, 0, frame().width, mapHeight});
  showIn(*contentView(), weatherView_, {0, mapHeight, frame().width, frame().height - mapHeight});
}

static const RegisteredClass<CHWorkoutDetailMapAndWeatherTableViewCell> registered;

}  // namespace ax::host
