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
  return workout ? speed(workout->totalDistance(), workout->duration()) : nullptr;
}

Ref<Quantity> CHWorkoutDataCalculator::speed(const Ref<Quantity>& distance, double seconds) {
  if (!distance || seconds <= 0) return nullptr;
  constexpr double hour = 3600;
  const Ref<Unit> unit = unitOf(distance);
  return quantity(distance->doubleValueForUnit(unit) / (seconds / hour),
                  unit->unitDividedByUnit(*Unit::hourUnit()));
}

double CHWorkoutDataCalculator::pace(const Ref<Quantity>& distance, double seconds) {
  const double units = distance ? distance->doubleValueForUnit(unitOf(distance)) : 0;
  return units > 0 ? seconds / units : 0;
}

ShownPace CHWorkoutDataCalculator::shownPace(double secondsPerUnit, const Ref<Quantity>& distance,
                                             std::int64_t activityType) {
  const Ref<Unit> unit = unitOf(distance);
  if (activityType != workoutActivityTypeNamed("swimming")) return {secondsPerUnit, unit};
  const bool isInYards =
      distance && distance->unit() && (distance->unit()->text() == "yd" || unit->text() == "mi");
  const Ref<Unit> swum = Unit::unitFromString(isInYards ? "yd" : "m");
  constexpr double hundred = 100;
  return {secondsPerUnit * quantity(hundred, swum)->doubleValueForUnit(unit), swum};
}

Ref<Unit> CHWorkoutDataCalculator::unitOf(const Ref<Quantity>& distance) {
  const bool isInMiles = distance && distance->unit() && distance->unit()->text() == "mi";
  return Unit::unitFromString(isInMiles ? "mi" : "km");
}

static const RegisteredClass<CHWorkoutDataCalculator> registered;

}  // namespace ax::host
