#pragma once

#include <optional>
#include <vector>

#include "reader/snapshot/DataSeries.h"

namespace ax::reader {

struct ValueRange {
  double low;
  double high;
};

// The figures that each slice speaks of: "96 to 127 beats per minute" is a range, "12 calories" one value,
// and lengths of time are counted in minutes. Nothing for a slice without figures. Main thread only, in the
// language that the slices are told in.
std::vector<std::optional<ValueRange>> sliceValues(const DataSeries& series);

}  // namespace ax::reader
