#pragma once

#include <pugixml.hpp>
#include <vector>

#include "reader/importers/WorkoutFile.h"

namespace ax::reader {

// One activity for each track below a gpx element; waypoints and planned routes are no workouts. Never fails:
// a track that tells nothing comes back without points.
std::vector<WorkoutActivity> readGpx(pugi::xml_node root);

}  // namespace ax::reader
