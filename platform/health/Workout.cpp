#include "platform/health/Workout.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax {

Class& Source::staticClass() {
  static Class& result =
      ClassBuilder<Source>("Source", Object::staticClass()).instanceVariable<&Source::name_>("name").build();
  return result;
}

Class& SourceRevision::staticClass() {
  static Class& result = ClassBuilder<SourceRevision>("SourceRevision", Object::staticClass())
                             .instanceVariable<&SourceRevision::source_>("source")
                             .build();
  return result;
}

Class& Workout::staticClass() {
  static Class& result = ClassBuilder<Workout>("Workout", Object::staticClass())
                             .instanceVariable<&Workout::activityType_>("workoutActivityType")
                             .instanceVariable<&Workout::duration_>("duration")
                             .instanceVariable<&Workout::startDate_>("startDate")
                             .instanceVariable<&Workout::endDate_>("endDate")
                             .instanceVariable<&Workout::sourceRevision_>("sourceRevision")
                             .instanceVariable<&Workout::totalDistance_>("totalDistance")
                             .instanceVariable<&Workout::totalEnergyBurned_>("totalEnergyBurned")
                             .build();
  return result;
}

Class& HeartRateSummaryReading::staticClass() {
  using T = HeartRateSummaryReading;
  static Class& result = ClassBuilder<T>("HeartRateSummaryReading", Object::staticClass())
                             .instanceVariable<&T::date_>("date")
                             .instanceVariable<&T::quantity_>("quantity")
                             .build();
  return result;
}

static const RegisteredClass<Source> registeredSource;
static const RegisteredClass<SourceRevision> registeredRevision;
static const RegisteredClass<Workout> registered;
static const RegisteredClass<HeartRateSummaryReading> registeredReading;

}  // namespace ax
