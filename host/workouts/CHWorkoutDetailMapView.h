#pragma once

#include "platform/toolkit/Label.h"

namespace ax::host {

// The map of a workout's route, with a title over it.
class CHWorkoutDetailMapView : public View {
 public:
  static Class& staticClass();

  // Puts the title over the map.
  void layoutSubviews() override;

 private:
  Ref<Label> titleLabel_;
};

// The map as a cell shows it: "_CHWorkoutDetailMapView".
class CHWorkoutDetailMapViewInCell : public CHWorkoutDetailMapView {
 public:
  static Class& staticClass();
};

}  // namespace ax::host
