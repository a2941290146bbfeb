#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "apps/view/model/ScreenModel.h"

// Charts, stepped through value by value. Main thread only.
namespace ax::view {

struct ChartStep {
  ItemId item = 0;        // the element that shows the value; 0 where the chart has none
  std::string line = {};  // what is said where there is no element
};

// Where somebody is in a chart.
class ChartTour {
 public:
  // The step after (1) or before (-1) the last one, or after or before the focused element; null at the ends
  // and outside charts. It lives until the next call.
  const ChartStep* step(const ScreenModel& model, ItemId focus, int direction);
  // All of the chart that the last step was in, and which of them it was.
  ItemId chart() const { return chart_; }
  const std::vector<ChartStep>& steps() const { return steps_; }
  std::size_t at() const { return std::size_t(at_); }
  // Begins anew at the next step.
  void leave() { chart_ = 0; }

 private:
  void enter(const ScreenModel& model, ItemId chart, ItemId focus);

  ItemId chart_ = 0;
  std::vector<ChartStep> steps_;
  std::ptrdiff_t at_ = -1;
};

// The steps of a chart from left to right: its elements but for headings, else its values.
std::vector<ChartStep> stepsOfChart(const ScreenModel& model, const Item& chart);

// What a slice says of itself; empty for one that there is not. Slices count from 0.
std::string sliceLine(const Item& chart, std::size_t slice);

// Whether the item is the first that is read of a chart.
bool isFirstIn(const ScreenModel& model, ItemId chart, ItemId item);

}  // namespace ax::view
