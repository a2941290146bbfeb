#pragma once

#include <vector>

#include "platform/runtime/Geometry.h"
#include "reader/snapshot/Snapshot.h"

namespace ax::reader {

// What a chart shows, as shapes in the space that it was drawn for. Time runs from left to right in every
// language.
struct ChartDrawing {
  Rect plot;                              // between the axes: the horizontal one lies at its lower end
  std::vector<Rect> bars;                 // one of no height for 0, none where there is no value
  std::vector<std::vector<Point>> lines;  // a piece for each stretch without a gap; never an empty one
};

// The values of a chart within `plot`: its series, else what its slices tell. Values beyond the ends of an
// axis lie on its ends. Empty for a chart without numbers.
ChartDrawing drawChart(const DataSeries& series, const Rect& plot);

// The same where the chart stands on its screen: over the elements to step to where it has some, each bar
// over its own where there are as many, else over all of the chart. The node must have a series.
ChartDrawing drawChartOnScreen(const Snapshot& snapshot, const Node& chart);

}  // namespace ax::reader
