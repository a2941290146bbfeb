#include "reader/picture/ChartValues.h"

#include <algorithm>
#include <cmath>

#include "reader/speech/SliceQuantity.h"

namespace ax::reader {

namespace {

// The kind of series that is drawn as bars; others are lines.

// Also what is no number, since bars keep its place free.
std::vector<ChartValue> pointsOf(const DataSeries& series) {
  const auto& [x, y] = series.axes;
  std::vector<ChartValue> points;
  bool isAfterGap = false;
  for (std::size_t i = 0; i < std::min(x.values.size(), y.values.size()); ++i) {
    const double at = x.values[i], value = y.values[i];
    if (std::isfinite(at)) points.push_back({at, at, value, value, isAfterGap});
    isAfterGap = !std::isfinite(value);
  }
  std::ranges::stable_sort(points, {}, &ChartValue::start);
  return points;
}

// How many values stand close together in each group, such as two bars for one day; 1 when they stand evenly.
std::size_t groupSize(const std::vector<ChartValue>& values, double shortest) {
  constexpr double farther = 2;  // in shortest steps: so far apart groups begin
  std::vector<std::size_t> sizes = {1};
  for (std::size_t i = 1; i < values.size(); ++i) {
    const bool begins = values[i].start - values[i - 1].start > shortest * farther;
    if (begins) sizes.push_back(0);
    ++sizes.back();
  }
  const bool areAlike = std::ranges::all_of(sizes, [&](std::size_t size) { return size == sizes.front(); });
  return sizes.size() > 1 && areAlike ? sizes.front() : 1;
}

double shortestStep(const std::vector<ChartValue>& values, std::size_t apart) {
  double shortest = 0;
  for (std::size_t i = apart; i < values.size(); i += apart) {
    const double step = values[i].start - values[i - apart].start;
    if (step > 0 && (shortest == 0 || step < shortest)) shortest = step;
  }
  return shortest;
}

// Each bar gets its part of the way to where the next could begin.
void widenToBars(std::vector<ChartValue>& values) {
  const double shortest = shortestStep(values, 1);
  const std::size_t size = groupSize(values, shortest);
  const double pitch = size > 1 ? shortestStep(values, size) : shortest;
  const double width = (pitch > 0 ? pitch : 1) / double(size);
  for (std::size_t i = 0; i < values.size(); ++i) {
    values[i].start = values[i - i % size].start + double(i % size) * width;
    values[i].end = values[i].start + width;
  }
}

std::vector<ChartValue> rangesOf(const DataSeries& series) {
  std::vector<ChartValue> ranges;
  const auto quantities = sliceQuantities(series);
  for (std::size_t i = 0; i < quantities.size(); ++i) {
    const DataSlice& slice = series.slices[i];
    const bool hasPlace = std::isfinite(slice.start) && std::isfinite(slice.end);
    if (hasPlace && quantities[i]) {
      ranges.push_back({slice.start, slice.end, quantities[i]->low, quantities[i]->high});
    }
  }
  return ranges;
}

AxisRange range(std::optional<double> low, std::optional<double> high) {
  const double from = low && std::isfinite(*low) ? *low : 0;
  const double to = high && std::isfinite(*high) ? *high : from + 1;
  return {from, to > from ? to : from + 1};
}

void findRanges(ChartValues& chart, const DataSeries& series) {
  std::optional<double> left = series.axes[horizontalAxis].minimum,
                        right = series.axes[horizontalAxis].maximum;
  std::optional<double> low = series.axes[verticalAxis].minimum, high = series.axes[verticalAxis].maximum;
  const double lowest = std::ranges::min_element(chart.values, {}, &ChartValue::low)->low;
  const double highest = std::ranges::max_element(chart.values, {}, &ChartValue::high)->high;
  if (!left) left = chart.values.front().start;
  // An axis of bars may end where the last of them begins.
  const double end = chart.values.back().end;
  if (!right || (chart.areBars && *right < end)) right = end;
  if (!low) low = chart.areBars && !chart.hasRanges ? std::min(0.0, lowest) : lowest;
  if (!high) high = highest;
  chart.x = range(left, right);
  chart.y = range(low, high);
}

}  // namespace

ChartValues chartValues(const DataSeries& series) {
  ChartValues chart;
  chart.values = pointsOf(series);
  chart.areBars = series.type == barSeries;
  if (chart.areBars) widenToBars(chart.values);
  std::erase_if(chart.values, [](const ChartValue& value) { return !std::isfinite(value.high); });
  if (chart.values.empty()) {
    chart.values = rangesOf(series);
    chart.areBars = true;
    chart.hasRanges =
        std::ranges::any_of(chart.values, [](const ChartValue& value) { return value.low != value.high; });
  }
  if (!chart.values.empty()) findRanges(chart, series);
  return chart;
}

}  // namespace ax::reader
