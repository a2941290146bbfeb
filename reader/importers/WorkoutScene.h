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
  std::string timeZone = "UTC";
  DistanceUnits units = DistanceUnits::byLocale;  // miles in the regions that count in them
};

// The app's screen of a workout as a scene: the first activity that has points in detail, followed by a list
// of the file's others. What the file does not tell has no row: no map without positions, no pace without a
// distance, no splits without laps; without heart rate the chart's row says so. `now` is the workout's end.
//
// Takes formatters of the current region out of use while it runs. Main thread only.
nlohmann::ordered_json workoutScene(const WorkoutFile& file, const WorkoutSceneOptions& options = {});

// The app's list of all activities of several files as a scene: the totals, then month by month, the latest
// first.
nlohmann::ordered_json workoutListScene(const std::vector<WorkoutFile>& files,
                                        const WorkoutSceneOptions& options = {});

}  // namespace ax::reader
