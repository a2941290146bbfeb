#pragma once

#include <cstddef>
#include <optional>
#include <vector>

#include "reader/snapshot/Snapshot.h"

namespace ax::reader {

// A chart as a row of notes, in the order of its horizontal axis.
struct ChartNote {
  std::optional<double> value;  // nothing: a rest, where the chart has a gap
  double place = 0;             // along the horizontal axis, from 0 to 1
};

struct ChartNotes {
  double minimum = 0;  // of the vertical axis; where the chart does not tell, of its values
  double maximum = 0;
  std::vector<ChartNote> notes;
  std::size_t averaged = 0;  // how many values the notes are averages of; 0 when each has its own

  // Where a value lies between minimum and maximum, from 0 to 1; 0 when these are equal.
  double heightOf(double value) const;
};

inline constexpr std::size_t mostNotes = 60;

// Whether it is the slices that sound: a series of values comes first.
bool playsSlices(const DataSeries& series);

// The notes of a chart of the snapshot: one for each value; of more than 60 values, one for each of 60 equal
// spans of the horizontal axis, their average; of slices alone, the lowest and the highest of each. A gap is
// a value that is no number, one of 0 that the chart shows no bar for, a span without values, a slice without
// a figure, and, where most values follow a regular step, each step that is left out. Main thread only, in
// the language of the snapshot.
ChartNotes notesOfChart(const Snapshot& snapshot, const Node& chart);

}  // namespace ax::reader
