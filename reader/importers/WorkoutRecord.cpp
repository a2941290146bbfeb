#include "reader/importers/WorkoutRecord.h"

#include <algorithm>
#include <array>
#include <vector>

#include "platform/health/Workout.h"
#include "reader/importers/SceneWriting.h"

namespace ax::reader {

using Json = nlohmann::ordered_json;

const DistanceUnit kilometers{"km", 1000};
const DistanceUnit miles{"mi", 1609.344};

namespace {

const DistanceUnit meters{"m", 1};
const DistanceUnit yards{"yd", 0.9144};
const DistanceUnit feet{"ft", 0.3048};

constexpr std::array<std::string_view, 4> regionsInMiles = {"US", "GB", "LR", "MM"};

// "US" of "en_US" or "en_Latn_US"; empty when the locale names no region.
std::string_view regionOf(std::string_view locale) {
  locale = locale.substr(0, locale.find_first_of("@."));
  const std::size_t last = locale.find_last_of("_-");
  return last == std::string_view::npos ? std::string_view() : locale.substr(last + 1);
}

Json sourceRevision(const std::string& name) {
  return sceneObject("SourceRevision", {{"source", sceneObject("Source", {{"name", name}})}});
}

Json readingOf(const TrackPoint& point) {
  return sceneObject("HeartRateSummaryReading", {{"date", sceneDate(point.time)},
                                                 {"quantity", sceneQuantity(*point.heartRate, "count/min")}});
}

struct Extremes {
  const TrackPoint* lowest = nullptr;
  const TrackPoint* highest = nullptr;
};

// The stretches divide the time as the slices of a chart do, so that each slice keeps its range.
std::vector<const TrackPoint*> extremesOf(const WorkoutActivity& activity) {
  constexpr std::size_t count = 8000;
  std::vector<Extremes> stretches(count);
  for (const TrackPoint& point : activity.points) {
    if (!point.heartRate || activity.duration <= 0) continue;
    const double place = (point.time - activity.start) / activity.duration * count;
    Extremes& stretch = stretches[static_cast<std::size_t>(std::clamp(place, 0.0, count - 1.0))];
    if (stretch.lowest == nullptr || point.heartRate < stretch.lowest->heartRate) stretch.lowest = &point;
    if (stretch.highest == nullptr || point.heartRate > stretch.highest->heartRate) stretch.highest = &point;
  }
  std::vector<const TrackPoint*> kept;
  for (const auto& [lowest, highest] : stretches) {
    if (lowest == nullptr) continue;
    kept.push_back(std::min(lowest, highest));
    if (lowest != highest) kept.push_back(std::max(lowest, highest));
  }
  return kept;
}

}  // namespace

DistanceUnit distanceUnitOf(const WorkoutActivity& activity, const DistanceUnit& unit) {
  if (activity.sport != "swimming") return unit;
  const bool isInYards = activity.poolMetres > 0 ? activity.isPoolInYards : unit.name == miles.name;
  return isInYards ? yards : meters;
}

DistanceUnit heightUnitFor(const DistanceUnit& unit) {
  return unit.name == miles.name || unit.name == yards.name ? feet : meters;
}

DistanceUnit distanceUnitOfLocale(const std::string& locale) {
  return std::ranges::count(regionsInMiles, regionOf(locale)) != 0 ? miles : kilometers;
}

Json distanceQuantity(double metres, const DistanceUnit& unit) {
  return sceneQuantity(metres / unit.metres, unit.name);
}

Json workoutRecord(const WorkoutActivity& activity, const DistanceUnit& unit, const std::string& id) {
  Json members = {{"workoutActivityType", workoutActivityTypeNamed(activity.sport)},
                  {"duration", activity.activeSeconds}};
  if (activity.start != 0) {
    members["startDate"] = sceneDate(activity.start);
    members["endDate"] = sceneDate(activity.start + activity.duration);
  }
  if (!activity.sourceName.empty()) members["sourceRevision"] = sourceRevision(activity.sourceName);
  if (activity.metres > 0) members["totalDistance"] = distanceQuantity(activity.metres, unit);
  if (const auto& energy = activity.measures.kilocalories) {
    members["totalEnergyBurned"] = sceneQuantity(*energy, "kcal");
  }
  return sceneObject("Workout", std::move(members), id);
}

Json heartRateReadings(const WorkoutActivity& activity) {
  constexpr std::ptrdiff_t most = 20000;
  const auto isReading = [](const TrackPoint& point) { return point.heartRate.has_value(); };
  Json readings = Json::array();
  if (std::ranges::count_if(activity.points, isReading) > most) {
    for (const TrackPoint* point : extremesOf(activity)) readings.push_back(readingOf(*point));
    return readings;
  }
  for (const TrackPoint& point : activity.points) {
    if (isReading(point)) readings.push_back(readingOf(point));
  }
  return readings;
}

}  // namespace ax::reader
