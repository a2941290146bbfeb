#pragma once

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "reader/snapshot/Snapshot.h"

// The charts of a snapshot, described. The nodes belong to the snapshot; a chart is one that has a series.
// Main thread only.
namespace ax::reader {

// A chart in words of the reader's language, a line for each axis, value list, position, element and slice.
// Lines that tell more of the one before are indented.
std::vector<std::string> describeChart(const Snapshot& snapshot, const Node& chart);

// When a slice is: the time of day where the chart has one, else how much later than its beginning.
std::string spokenSpan(const DataSlice& slice);

// One slice of a chart in such words, counted from 0: when it is and what it shows. Empty for one that there
// is not.
std::string describeSlice(const DataSeries& series, std::size_t index);

nlohmann::ordered_json chartAsJson(const Snapshot& snapshot, const Node& chart);

}  // namespace ax::reader
