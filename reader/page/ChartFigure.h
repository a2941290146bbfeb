#pragma once

#include <string>
#include <vector>

#include "reader/picture/Markup.h"
#include "reader/snapshot/Snapshot.h"

namespace ax::reader {

// What a chart is called in its figure; never empty.
std::string captionOf(const Snapshot& snapshot, const Node& chart);

// Opens the figure of a chart with its name and its picture; the caller closes it. `id` is free for it.
void openChartFigure(Markup& html, const Snapshot& snapshot, const Node& chart, const std::string& id);

// The times and quantities of a chart's slices as a table; nothing for a chart without.
void addSliceTable(Markup& html, const DataSeries& series);

// A table of elements with their numbers, names and values, of these rows; values are left out where none has
// one. The caller writes each row's number.
class ChartTable {
 public:
  ChartTable(Markup& html, const std::vector<const Node*>& rows);

  void addCells(const Node& row);
  void close();

 private:
  Markup& html_;
  bool hasValues_;
};

}  // namespace ax::reader
