#pragma once

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "reader/snapshot/Snapshot.h"

// The charts of a snapshot, described. The nodes belong to the snapshot; a chart is one that has a series.
// Main thread only.
namespace ax::reader {

// The nodes that are charts, in reading order.
std::vector<const Node*> charts(const Snapshot& snapshot);

// The elements inside a chart, in reading order: its bars, and what it shows beside them.
std::vector<const Node*> elementsOfChart(const Snapshot& snapshot, const Node& chart);

// A chart in words of the reader's language, a line for each axis, value list, position, element and slice.
// Lines that tell more of the one before are indented.
std::vector<std::string> describeChart(const Snapshot& snapshot, const Node& chart);

nlohmann::ordered_json chartAsJson(const Snapshot& snapshot, const Node& chart);

}  // namespace ax::reader
