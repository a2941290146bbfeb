#pragma once

#include <optional>

#include "reader/snapshot/DataSeries.h"
#include "reader/snapshot/HostQuestions.h"

// What a chart that is told in slices does not answer itself, found where it stands and in what it shows.
namespace ax::reader {

// The title of the cell that the chart is in, else what it is a chart of; nothing when neither is known.
std::optional<AttributedText> nameOfSliceChart(Object& chart, HostQuestions& questions);

// When a moment of the chart is, given in seconds after its beginning; nothing for a chart of no certain
// time. The slices of a day are cut by the clock on the wall, those of anything else by what has passed.
class SliceTimes {
 public:
  explicit SliceTimes(const Object& chart);

  std::optional<double> after(double seconds) const;

 private:
  std::optional<double> start_;
  bool isByClock_ = false;
};

}  // namespace ax::reader
