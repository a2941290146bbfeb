#include "reader/importers/WorkoutRecord.h"

#include <algorithm>
#include <array>

#include "platform/health/Workout.h"
#include "reader/importers/SceneWriting.h"

namespace ax::reader {

using Json = nlohmann::ordered_json;

const DistanceUnit kilometers{"km", 1000};
const DistanceUnit miles{"mi", 1609.344};

namespace {

constexpr std::array<std::string_view, 4> regionsInMiles = {"US", "GB", "LR", "MM"};

// "US" of "en_US" or "en_Latn_US"; empty when the locale names no region.
std::string_view regionOf(std::string_view locale) {
  locale = locale.substr(0, locale.find_first_of("@."));
  const std::size_t last = locale.find_last_of("_-");
  return last == std::string_view::npos ? std::string_view() : locale.substr(last + 1);
}

bool isDated(const WorkoutActivity& activity) {
  return !activity.points.empty() || !activity.laps.empty();
}

Json sourceRevision(const std::string& name) {
  return sceneObject("SourceRevision", {{"source", sceneObject("Source", {{"name", name}})}});
}

}  // namespace

DistanceUnit distanceUnitOfLocale(const std::string& locale) {
  return std::ranges::count(regionsInMiles, regionOf(locale)) != 0 ? miles : kilometers;
}

Json distanceQuantity(double metres, const DistanceUnit& unit) {
  return sceneQuantity(metres / unit.metres, unit.name);
}

Json workoutRecord(const WorkoutActivity& activity, const DistanceUnit& unit, const std::string& id) {
  Json members = {{"workoutActivityType", workoutActivityTypeNamed(activity.sport)},
                  {"duration", sceneNumber(activity.activeSeconds)}};
  if (isDated(activity)) {
    members["startDate"] = sceneDate(activity.start);
    members["endDate"] = sceneDate(activity.start + activity.duration);
  }
  if (!activity.sourceName.empty()) members["sourceRevision"] = sourceRevision(activity.sourceName);
  if (activity.metres > 0) members["totalDistance"] = distanceQuantity(activity.metres, unit);
  if (activity.kilocalories) members["totalEnergyBurned"] = sceneQuantity(*activity.kilocalories, "kcal");
  return sceneObject("Workout", std::move(members), id);
}

Json heartRateReadings(const WorkoutActivity& activity) {
  Json readings = Json::array();
  for (const TrackPoint& point : activity.points) {
    if (!point.heartRate) continue;
    readings.push_back(sceneObject(
        "HeartRateSummaryReading",
        {{"date", sceneDate(point.time)}, {"quantity", sceneQuantity(*point.heartRate, "count/min")}}));
  }
  return readings;
}

std::optional<HeartRateFigures> heartRateFigures(const WorkoutActivity& activity) {
  double sum = 0;
  double highest = 0;
  std::size_t count = 0;
  for (const TrackPoint& point : activity.points) {
    if (!point.heartRate) continue;
    sum += *point.heartRate;
    highest = std::max(highest, *point.heartRate);
    ++count;
  }
  if (count == 0) return std::nullopt;
  return HeartRateFigures{sum / static_cast<double>(count), highest};
}

bool hasRoute(const WorkoutActivity& activity) {
  return std::ranges::any_of(activity.points, [](const TrackPoint& p) { return p.latitude.has_value(); });
}

}  // namespace ax::reader
