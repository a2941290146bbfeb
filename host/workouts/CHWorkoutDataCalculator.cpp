#include "host/workouts/CHWorkoutDataCalculator.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHWorkoutDataCalculator::staticClass() {
  using T = CHWorkoutDataCalculator;
  static Class& result = ClassBuilder<T>("CHWorkoutDataCalculator", Object::staticClass())
                             .method<&T::paceForWorkout>("paceForWorkout:")
                             .method<&T::speedForWorkout>("speedForWorkout:")
                             .build();
  return result;
}

double CHWorkoutDataCalculator::paceForWorkout(Ref<Workout> workout) {
  return workout ? pace(workout->totalDistance(), workout->duration()) : 0;
}

Ref<Quantity> CHWorkoutDataCalculator::speedForWorkout(Ref<Workout> workout) {
  if (!workout || !workout->totalDistance() || workout->duration() <= 0) return nullptr;
  const Ref<Unit> unit = unitOf(workout->totalDistance());
  const double hours = workout->duration() / 3600;
  return quantity(workout->totalDistance()->doubleValueForUnit(unit) / hours,
                  unit->unitDividedByUnit(*Unit::hourUnit()));
}

double CHWorkoutDataCalculator::pace(const Ref<Quantity>& distance, double seconds) {
  const double units = distance ? distance->doubleValueForUnit(unitOf(distance)) : 0;
  return units > 0 ? seconds / units : 0;
}

Ref<Unit> CHWorkoutDataCalculator::unitOf(const Ref<Quantity>& distance) {
  const bool isInMiles = distance && distance->unit() && distance->unit()->text() == "mi";
  return Unit::unitFromString(isInMiles ? "mi" : "km");
}

static const RegisteredClass<CHWorkoutDataCalculator> registered;

}  // namespace ax::host
