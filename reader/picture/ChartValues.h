#pragma once

#include <vector>

#include "reader/snapshot/DataSeries.h"

namespace ax::reader {

struct AxisRange {
  double low = 0;
  double high = 1;  // always above low
};

// One value of a chart, over a part of the horizontal axis. Bars have a width; points of a line begin where
// they end.
struct ChartValue {
  double start;
  double end;
  double low;  // the same as high unless the chart tells ranges
  double high;
  bool isAfterGap = false;  // a value before it is no number
};

// The numbers of a chart as they are drawn, in the order of the horizontal axis, with the ranges of both
// axes: the chart's own, else that of its values. All numbers are finite.
struct ChartValues {
  std::vector<ChartValue> values;
  AxisRange x;
  AxisRange y;
  bool areBars = false;
  bool hasRanges = false;  // bars reach from low to high; else from 0
};

// Of its series where it has values, else of the quantities of its slices that are numbers.
ChartValues chartValues(const DataSeries& series);

}  // namespace ax::reader
