#pragma once

#include <vector>

#include "reader/snapshot/Snapshot.h"

namespace ax::reader {

// Which of a chart's values are gaps, one flag for each: a chart answers 0 for what it has no figure for, and
// shows no bar there. All false where bars and values cannot be matched.
std::vector<bool> valuesWithoutBar(const Snapshot& snapshot, const Node& chart);

}  // namespace ax::reader
