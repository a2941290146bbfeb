#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "platform/toolkit/DataSeriesMessages.h"
#include "reader/text/AttributedText.h"

namespace ax::reader {

// What a chart says of a place on one of its axes; the position runs from 0 to 1.
struct PositionDescription {
  double position;
  AttributedText text;
};

struct DataSeriesAxis {
  std::optional<AttributedText> title;
  std::optional<AttributedText> unitLabel;
  std::optional<double> minimum;
  std::optional<double> maximum;
  std::vector<double> values;
  std::vector<PositionDescription> positions;  // only those that the chart describes
};

struct DataSlice {
  double start;  // seconds after the beginning of the chart's time
  double end;
  std::optional<AttributedText> quantity;
  std::optional<double> startTime = {};  // seconds since 1970, where the chart tells when it begins
  std::optional<double> endTime = {};
};

// A chart as it describes itself: as a data series with two axes, as a row of time slices, or both.
struct DataSeries {
  bool hasAxes = false;                // else type, flags and axes say nothing
  std::optional<AttributedText> name;  // its own; of slices alone, what stands for one
  std::int64_t type = 0;
  bool supportsSummarization = false;
  bool supportsSonification = false;
  std::array<DataSeriesAxis, 2> axes;  // by Axis

  bool usesSlices = false;
  double secondsPerSlice = 0;
  std::uint64_t hoursPerSlice = 0;  // whole hours; 0 also when the chart does not tell
  std::vector<DataSlice> slices;
};

}  // namespace ax::reader
