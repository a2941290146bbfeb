#include "reader/snapshot/ShownSeries.h"

#include <algorithm>
#include <cmath>
#include <limits>

#include "reader/snapshot/Charts.h"

namespace ax::reader {

namespace {

// Places are those of the screen or, where the screen is mirrored, from the other side.
struct Bars {
  std::vector<double> places;
  double step = 0;  // from one to the next; 0 where there is none
};

Bars barsOf(const Snapshot& snapshot, const Node& chart) {
  Bars bars;
  for (const Node* element : elementsOfChart(snapshot, chart)) {
    if ((element->traits & TraitHeader) != 0) continue;
    const double width = element->frame.width;
    bars.step = bars.places.empty() ? width : std::min(bars.step, width);
    bars.places.push_back(element->frame.x + width / 2);
  }
  for (std::size_t i = 1; i < bars.places.size(); ++i) {
    bars.step = std::min(bars.step, std::abs(bars.places[i] - bars.places[i - 1]));
  }
  return bars;
}

// How many values after that of the first bar each bar stands.
std::vector<std::size_t> indexesOf(const Bars& bars) {
  std::vector<std::size_t> indexes;
  for (const double place : bars.places) {
    indexes.push_back(std::size_t(std::lround(std::abs(place - bars.places.front()) / bars.step)));
  }
  return indexes;
}

// The values without a bar when the first bar is that of the value at `first`.
std::vector<bool> valuesBeside(const std::vector<std::size_t>& indexes, std::size_t first,
                               std::size_t count) {
  std::vector<bool> missing(count, true);
  for (const std::size_t index : indexes) missing[first + index] = false;
  return missing;
}

bool areZero(const std::vector<double>& values, const std::vector<bool>& chosen) {
  for (std::size_t i = 0; i < values.size(); ++i) {
    if (chosen[i] && values[i] != 0) return false;
  }
  return true;
}

// One flag for each value; all false where bars and values cannot be matched.
std::vector<bool> valuesWithoutBar(const Snapshot& snapshot, const Node& chart) {
  const std::vector<double>& values = chart.series->axes[verticalAxis].values;
  const std::vector<bool> none(values.size());
  const Bars bars = barsOf(snapshot, chart);
  // Wider bars stand for several values each.
  const bool isBarForValue = bars.step > 0 && bars.step * double(values.size()) < 1.5 * chart.frame.width;
  if (!isBarForValue) return none;
  const std::vector<std::size_t> indexes = indexesOf(bars);
  const std::size_t span = *std::ranges::max_element(indexes);
  const auto isSomething = [](double value) { return value != 0; };
  const auto something = std::size_t(std::ranges::find_if(values, isSomething) - values.begin());
  for (std::size_t first = 0; first <= something && first + span < values.size(); ++first) {
    std::vector<bool> missing = valuesBeside(indexes, first, values.size());
    if (areZero(values, missing)) return missing;
  }
  return none;
}

}  // namespace

DataSeries shownSeries(const Snapshot& snapshot, const Node& chart) {
  DataSeries series = *chart.series;
  const std::vector<bool> gaps = valuesWithoutBar(snapshot, chart);
  for (std::size_t i = 0; i < gaps.size(); ++i) {
    if (gaps[i]) series.axes[verticalAxis].values[i] = std::numeric_limits<double>::quiet_NaN();
  }
  return series;
}

}  // namespace ax::reader
