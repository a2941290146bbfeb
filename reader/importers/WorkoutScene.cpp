#include "reader/importers/WorkoutScene.h"

#include <algorithm>
#include <limits>

#include "platform/formatting/Region.h"
#include "reader/importers/WorkoutRows.h"

namespace ax::reader {

using Json = nlohmann::ordered_json;

namespace {

constexpr double summaryHeight = 200;

// Dates and months of the scene are those of its own region.
class RegionOfScene {
 public:
  explicit RegionOfScene(const WorkoutSceneOptions& options) {
    formatting::setCurrentRegion({options.locale, options.timeZone});
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

std::vector<const WorkoutActivity*> activitiesOf(const std::vector<WorkoutFile>& files) {
  std::vector<const WorkoutActivity*> activities;
  for (const WorkoutFile& file : files) {
    for (const WorkoutActivity& activity : file.activities) activities.push_back(&activity);
  }
  return activities;
}

Json totalsRow(const std::vector<ListedActivity>& activities) {
  Json records = Json::array();
  for (const ListedActivity& listed : activities) records.push_back(listed.record);
  return sceneObject("CHWorkoutsListSummaryTableViewCell", {{"workouts", std::move(records)}}, "totals");
}

}  // namespace

Json workoutScene(const WorkoutFile& file, const WorkoutSceneOptions& options) {
  const RegionOfScene region(options);
  const DistanceUnit unit = unitFor(options);
  const auto shown =
      std::ranges::find_if(file.activities, [](const auto& each) { return !each.points.empty(); });
  SceneRows rows;
  addDetailRows(rows, *shown, unit);
  std::vector<ListedActivity> others;
  for (const WorkoutActivity& activity : file.activities) {
    if (&activity != &*shown) others.push_back({&activity, workoutRecord(activity, unit, "")});
  }
  addListRows(rows, std::move(others));
  return sceneOf(titleOf(*shown), appText("workout." + shown->sport), endOf(*shown), rows);
}

Json workoutListScene(const std::vector<WorkoutFile>& files, const WorkoutSceneOptions& options) {
  const RegionOfScene region(options);
  const DistanceUnit unit = unitFor(options);
  double now = std::numeric_limits<double>::lowest();
  std::vector<ListedActivity> activities;
  for (const WorkoutActivity* activity : activitiesOf(files)) {
    const std::string id = "workout-" + std::to_string(activities.size() + 1);
    activities.push_back({activity, workoutRecord(*activity, unit, id)});
    now = std::max(now, endOf(*activity));
  }
  SceneRows rows;
  rows.add(totalsRow(activities), summaryHeight);
  for (std::size_t i = 0; i < activities.size(); ++i) {
    activities[i].record = sceneReference("workout-" + std::to_string(i + 1));
  }
  addListRows(rows, std::move(activities));
  return sceneOf(appText("workouts.title"), appText("workouts.title"), now, rows);
}

}  // namespace ax::reader
