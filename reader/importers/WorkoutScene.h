#pragma once

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "reader/importers/WorkoutFile.h"

namespace ax::reader {

enum class DistanceUnits { byLocale, metric, imperial };

// How the person who hears the scene has set up the device. Unknown locales and zones count as the defaults.
struct WorkoutSceneOptions {
  std::string locale = "en_US";
  std::string timeZone = {};  // empty: the clock that the file was written by, or UTC where it names none
  DistanceUnits units = DistanceUnits::byLocale;  // miles in the regions that count in them
};

// The app's screen of a workout as a scene. What the file does not tell has no row: no map without positions,
// no pace without a distance, no splits without laps; without heart rate the chart's row says so. `now` is
// the workout's end.
//
// Takes formatters of the current region out of use while it runs. Main thread only.
nlohmann::ordered_json workoutScene(const WorkoutActivity& activity, const WorkoutSceneOptions& options = {});

// The app's list of workouts as a scene: the totals, then month by month, the latest first. Their points and
// laps are not read. The zone is that of the latest; a workout whose file was written by another clock is
// told by that one.
nlohmann::ordered_json workoutListScene(const std::vector<WorkoutActivity>& activities,
                                        const WorkoutSceneOptions& options = {});

// Drops what a list does not need.
void keepForList(WorkoutActivity& activity);

}  // namespace ax::reader
