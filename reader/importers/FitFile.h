#pragma once

#include <optional>
#include <string_view>
#include <vector>

#include "reader/importers/FitMessages.h"
#include "reader/importers/WorkoutFile.h"

namespace ax::reader {

struct FitContent {
  std::vector<WorkoutActivity> activities;
  std::optional<FitFault> fault;  // where the reading ended early; the activities are those before it
};

// One activity for each session, in the order of time; files without a session make one of their laps and
// records. What lies between two legs of a triathlon is no activity. Never fails otherwise.
FitContent readFit(std::string_view bytes);

}  // namespace ax::reader
