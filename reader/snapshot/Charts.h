#pragma once

#include <vector>

#include "reader/snapshot/Snapshot.h"

// The charts of a snapshot; a chart is a node that has a series. The nodes belong to the snapshot.
namespace ax::reader {

// The nodes that are charts, in reading order.
std::vector<const Node*> charts(const Snapshot& snapshot);

// The elements inside a chart, in reading order: its bars, and what it shows beside them.
std::vector<const Node*> elementsOfChart(const Snapshot& snapshot, const Node& chart);

}  // namespace ax::reader
