#pragma once

#include <pugixml.hpp>
#include <vector>

#include "reader/importers/WorkoutFile.h"

namespace ax::reader {

// The activities below a TrainingCenterDatabase element, those of sessions of several sports among them.
// Never fails: an activity that tells nothing comes back without points and laps.
std::vector<WorkoutActivity> readTcx(pugi::xml_node root);

}  // namespace ax::reader
