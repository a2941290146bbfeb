#pragma once

#include "host/workouts/CHWorkoutDetailMapView.h"
#include "host/workouts/CHWorkoutDetailWeatherView.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// The row of a workout with a route: the map over the weather strip.
class CHWorkoutDetailMapAndWeatherTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  void layoutSubviews() override;

 private:
  Ref<CHWorkoutDetailMapViewInCell> mapView_;
  Ref<CHWorkoutDetailWeatherView> weatherView_;
};

}  // namespace ax::host
