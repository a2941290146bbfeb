#pragma once

#include <optional>
#include <vector>

#include "reader/snapshot/DataSeries.h"

namespace ax::reader {

// What the text of a slice tells in numbers: "106 to 136 beats per minute" is a range, "45 minutes" one value
// twice. Times are in minutes.
struct SliceQuantity {
  double low;
  double high;
};

// One for each slice; nothing for a slice that tells no number. Texts are read in the language and the digits
// of the region. Main thread only.
std::vector<std::optional<SliceQuantity>> sliceQuantities(const DataSeries& series);

}  // namespace ax::reader
