#include "reader/importers/WorkoutScene.h"

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <limits>
#include <optional>

#include "platform/formatting/Region.h"
#include "reader/importers/WorkoutRows.h"

namespace ax::reader {

using Json = nlohmann::ordered_json;

namespace {

constexpr double summaryHeight = 200;

// "GMT-05:00".
std::string zoneEastOfUtc(double seconds) {
  const int minutes = static_cast<int>(std::abs(seconds)) / 60;
  if (minutes == 0) return "UTC";
  char text[16];
  std::snprintf(text, sizeof text, "GMT%c%02d:%02d", seconds < 0 ? '-' : '+', minutes / 60 % 24,
                minutes % 60);
  return text;
}

// Dates and months of the scene are those of its own region.
class RegionOfScene {
 public:
  RegionOfScene(const WorkoutSceneOptions& options, std::optional<double> secondsEastOfUtc) {
    const std::string own = zoneEastOfUtc(secondsEastOfUtc.value_or(0));
    formatting::setCurrentRegion({options.locale, options.timeZone.empty() ? own : options.timeZone});
  }
  ~RegionOfScene() { formatting::setCurrentRegion(before_); }
  RegionOfScene(const RegionOfScene&) = delete;
  RegionOfScene& operator=(const RegionOfScene&) = delete;

 private:
  formatting::Region before_ = formatting::currentRegion();
};

DistanceUnit unitFor(const WorkoutSceneOptions& options) {
  if (options.units == DistanceUnits::metric) return kilometers;
  if (options.units == DistanceUnits::imperial) return miles;
  return distanceUnitOfLocale(options.locale);
}

double endOf(const WorkoutActivity& activity) {
  return activity.start + activity.duration;
}

Json sceneOf(Json title, Json screenTitle, double now, const SceneRows& rows) {
  const formatting::Region& region = formatting::currentRegion();
  return {
      {"format", "axvelto-scene/1"},
      {"title", std::move(title)},
      {"environment",
       {{"locale", region.locale}, {"timeZone", region.timeZone}, {"now", sceneDate(now)["date"]}}},
      {"screen", sceneObject("ViewController", {{"title", std::move(screenTitle)}, {"view", rows.table()}})}};
}

// The file's own name for it, else the kind of workout.
Json titleOf(const WorkoutActivity& activity) {
  return activity.title.empty() ? appText("workout." + activity.sport) : Json(activity.title);
}

// Of the latest that names one.
std::optional<double> clockOfLatest(const std::vector<WorkoutActivity>& activities) {
  const WorkoutActivity* latest = nullptr;
  for (const WorkoutActivity& activity : activities) {
    if (!activity.secondsEastOfUtc) continue;
    if (latest == nullptr || activity.start > latest->start) latest = &activity;
  }
  return latest == nullptr ? std::nullopt : latest->secondsEastOfUtc;
}

// Where the scene has a clock of its own, at the instant when that one shows what the file's showed.
WorkoutActivity listedFor(const WorkoutActivity& activity, std::optional<double> clock) {
  WorkoutActivity listed = activity;
  keepForList(listed);
  if (clock && activity.secondsEastOfUtc) listed.start += *activity.secondsEastOfUtc - *clock;
  return listed;
}

Json totalsRow(const std::vector<ListedActivity>& activities) {
  Json records = Json::array();
  for (const ListedActivity& listed : activities) records.push_back(listed.record);
  return sceneObject("CHWorkoutsListSummaryTableViewCell", {{"workouts", std::move(records)}}, "totals");
}

}  // namespace

Json workoutScene(const WorkoutActivity& activity, const WorkoutSceneOptions& options) {
  const RegionOfScene region(options, activity.secondsEastOfUtc);
  SceneRows rows;
  addDetailRows(rows, activity, unitFor(options));
  return sceneOf(titleOf(activity), appText("workout." + activity.sport), endOf(activity), rows);
}

Json workoutListScene(const std::vector<WorkoutActivity>& activities, const WorkoutSceneOptions& options) {
  const std::optional<double> clock = clockOfLatest(activities);
  const RegionOfScene region(options, clock);
  const DistanceUnit unit = unitFor(options);
  double now = std::numeric_limits<double>::lowest();
  std::vector<WorkoutActivity> shown;
  for (const WorkoutActivity& activity : activities) {
    shown.push_back(listedFor(activity, options.timeZone.empty() ? clock : std::nullopt));
    now = std::max(now, endOf(shown.back()));
  }
  std::vector<ListedActivity> listed;
  for (const WorkoutActivity& activity : shown) {
    const std::string id = "workout-" + std::to_string(listed.size() + 1);
    listed.push_back({&activity, workoutRecord(activity, unit, id)});
  }
  SceneRows rows;
  rows.add(totalsRow(listed), summaryHeight);
  for (std::size_t i = 0; i < listed.size(); ++i) {
    listed[i].record = sceneReference("workout-" + std::to_string(i + 1));
  }
  addListRows(rows, std::move(listed));
  return sceneOf(appText("workouts.title"), appText("workouts.title"), now, rows);
}

void keepForList(WorkoutActivity& activity) {
  activity.points = {};
  activity.segments = {};
  activity.laps = {};
  activity.lengths = {};
}

}  // namespace ax::reader
