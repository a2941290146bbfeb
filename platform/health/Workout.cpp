#include "platform/health/Workout.h"

#include <array>

#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

struct ActivityType {
  std::int64_t number;
  std::string_view sport;
};

constexpr std::array activityTypes = {
    ActivityType{10, "walking"},    ActivityType{11, "running"},
    ActivityType{12, "hiking"},     ActivityType{WorkoutActivityTypeCycling, "cycling"},
    ActivityType{14, "swimming"},   ActivityType{15, "rowing"},
    ActivityType{16, "strength"},   ActivityType{17, "yoga"},
    ActivityType{18, "wheelchair"},
};

}  // namespace

std::int64_t workoutActivityTypeNamed(std::string_view sport) {
  for (const ActivityType& type : activityTypes) {
    if (type.sport == sport) return type.number;
  }
  return 0;
}

std::string_view nameOfWorkoutActivityType(std::int64_t number) {
  for (const ActivityType& type : activityTypes) {
    if (type.number == number) return type.sport;
  }
  return "other";
}

Class& Source::staticClass() {
  static Class& result = ClassBuilder<Source>("Source", Object::staticClass())
                             .instanceVariable<&Source::name_>("name")
                             .instanceVariable<&Source::isNorvaleWatch_>("isNorvaleWatch")
                             .method<&Source::_isNorvaleWatch>("_isNorvaleWatch")
                             .build();
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
