#pragma once

#include "platform/toolkit/ImageView.h"
#include "platform/toolkit/Label.h"

namespace ax::host {

// The map of a workout's route, with a title over it.
class CHWorkoutDetailMapView : public View {
 public:
  static Class& staticClass();

  // Draws the route over the whole view and puts the title over it.
  void layoutSubviews() override;

 private:
  Ref<Label> titleLabel_;
  Ref<ImageView> routeView_;
};

// The map as a cell shows it: "_CHWorkoutDetailMapView".
class CHWorkoutDetailMapViewInCell : public CHWorkoutDetailMapView {
 public:
  static Class& staticClass();
};

}  // namespace ax::host
