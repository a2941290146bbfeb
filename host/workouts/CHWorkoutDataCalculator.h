#pragma once

#include "platform/health/Workout.h"

namespace ax::host {

// A pace as it is shown: per kilometer, mile, hundred meters or hundred yards. The unit is one of those; of a
// hundred it names the one.
struct ShownPace {
  double seconds = 0;
  Ref<Unit> unit;
};

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
  static Ref<Quantity> speed(const Ref<Quantity>& distance, double seconds);
  // Swimmers count hundreds; everyone else what `secondsPerUnit` counts.
  static ShownPace shownPace(double secondsPerUnit, const Ref<Quantity>& distance, std::int64_t activityType);
  // Kilometers, or miles when the distance is in miles.
  static Ref<Unit> unitOf(const Ref<Quantity>& distance);
};

}  // namespace ax::host
