#pragma once

#include <nlohmann/json.hpp>
#include <string>

#include "reader/importers/WorkoutFile.h"

namespace ax::reader {

// The unit in which a scene counts distances.
struct DistanceUnit {
  std::string name;
  double metres;
};

// Miles where the locale's region counts in them ("en_US", "en_GB"), else kilometers.
DistanceUnit distanceUnitOfLocale(const std::string& locale);
extern const DistanceUnit kilometers;
extern const DistanceUnit miles;

// Of one activity where others count in `unit`: who swims counts in meters, or in yards where the pool or the
// region does.
DistanceUnit distanceUnitOf(const WorkoutActivity& activity, const DistanceUnit& unit);
// Of heights: feet where distances count in miles.
DistanceUnit heightUnitFor(const DistanceUnit& unit);

nlohmann::ordered_json distanceQuantity(double metres, const DistanceUnit& unit);

// The activity as the health store keeps it, with what the file tells.
nlohmann::ordered_json workoutRecord(const WorkoutActivity& activity, const DistanceUnit& unit,
                                     const std::string& id);

// One HeartRateSummaryReading for each point with a heart rate, in the file's order. Of more than 20,000 the
// lowest and the highest of each of 8,000 equal stretches of time.
nlohmann::ordered_json heartRateReadings(const WorkoutActivity& activity);

}  // namespace ax::reader
