#pragma once

#include <optional>

#include "platform/health/Quantity.h"
#include "platform/health/Workout.h"
#include "platform/runtime/Number.h"
#include "tests/bundle/Members.h"

namespace ax {

// What a test wants to say of a workout; what it leaves out is missing.
struct SomeWorkout {
  const char* sport = "running";
  double seconds = 1800;
  std::optional<double> start = {};
  const char* source = nullptr;
  bool isWatch = false;
  double distance = 0;  // in `unit`
  const char* unit = "km";
  double kilocalories = 0;

  Ref<Workout> made() const {
    const auto workout = make<Workout>();
    setMember(*workout, "workoutActivityType", number(workoutActivityTypeNamed(sport)));
    setMember(*workout, "duration", number(seconds));
    if (start) setMember(*workout, "startDate", date(*start));
    if (source != nullptr) setMember(*workout, "sourceRevision", revision());
    if (distance > 0) setMember(*workout, "totalDistance", quantity(distance, Unit::unitFromString(unit)));
    if (kilocalories > 0)
      setMember(*workout, "totalEnergyBurned", quantity(kilocalories, Unit::kilocalorieUnit()));
    return workout;
  }

 private:
  Ref<Object> revision() const {
    const auto maker = make<Source>();
    setMember(*maker, "name", string(source));
    setMember(*maker, "isNorvaleWatch", number(isWatch));
    const auto result = make<SourceRevision>();
    setMember(*result, "source", maker);
    return result;
  }
};

}  // namespace ax
