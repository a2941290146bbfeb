#pragma once

#include "platform/health/Workout.h"

namespace ax::host {

// Works out what follows from a workout's distance and duration, in the unit of its distance.
class CHWorkoutDataCalculator : public Object {
 public:
  static Class& staticClass();

  // Seconds per kilometer or mile; 0 without a distance.
  double paceForWorkout(Ref<Workout> workout);
  // Nil without a distance or a duration.
  Ref<Quantity> speedForWorkout(Ref<Workout> workout);

  // The same for any stretch.
  static double pace(const Ref<Quantity>& distance, double seconds);
  // Kilometers, or miles when the distance is in miles.
  static Ref<Unit> unitOf(const Ref<Quantity>& distance);
};

}  // namespace ax::host
