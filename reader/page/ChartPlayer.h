#pragma once

#include "reader/picture/Markup.h"
#include "reader/snapshot/Snapshot.h"

namespace ax::reader {

// Writes a player that holds the sound of a chart; nothing for a chart without notes. The chart is a node of
// the snapshot with a series.
void addChartPlayer(Markup& html, const Snapshot& snapshot, const Node& chart);

}  // namespace ax::reader
