#pragma once

#include <vector>

#include "reader/importers/SceneWriting.h"
#include "reader/importers/WorkoutRecord.h"

namespace ax::reader {

// Puts one activity's detail screen into rows, from the summary to the map. Its record has the id "workout".
void addDetailRows(SceneRows& rows, const WorkoutActivity& activity, const DistanceUnit& unitOfRegion);

// One activity of a list with its record: the record itself, or a reference to it.
struct ListedActivity {
  const WorkoutActivity* activity;
  nlohmann::ordered_json record;
};

// Puts activities into rows by month, the latest first, each month under its header.
void addListRows(SceneRows& rows, std::vector<ListedActivity> activities);

}  // namespace ax::reader
