#pragma once

#include <vector>

#include "reader/snapshot/Snapshot.h"

namespace ax::reader {

// The series of a chart as it is shown: a chart answers 0 for what it has no figure for, and shows no bar
// there; such a value is no number here. The same as the chart's own where bars and values cannot be matched.
// The node belongs to the snapshot and has a series. Main thread only.
DataSeries shownSeries(const Snapshot& snapshot, const Node& chart);

}  // namespace ax::reader
