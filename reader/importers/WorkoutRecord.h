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

nlohmann::ordered_json distanceQuantity(double metres, const DistanceUnit& unit);

// The activity as the health store keeps it, with what the file tells.
nlohmann::ordered_json workoutRecord(const WorkoutActivity& activity, const DistanceUnit& unit,
                                     const std::string& id);

// One HeartRateSummaryReading for each point with a heart rate, in the file's order.
nlohmann::ordered_json heartRateReadings(const WorkoutActivity& activity);

struct HeartRateFigures {
  double average;  // over the points that have one
  double maximum;
};
// Empty without heart rate.
std::optional<HeartRateFigures> heartRateFigures(const WorkoutActivity& activity);

bool hasRoute(const WorkoutActivity& activity);

}  // namespace ax::reader
