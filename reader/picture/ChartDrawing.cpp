#include "reader/picture/ChartDrawing.h"

#include <algorithm>
#include <cmath>

#include "reader/picture/ChartValues.h"
#include "reader/snapshot/Charts.h"
#include "reader/snapshot/ShownSeries.h"

namespace ax::reader {

namespace {

// A step this much longer than most is a gap in a line.
constexpr double gapInSteps = 2.5;
// The part of a bar's place that it fills.
constexpr double filled = 0.8;

double clampedFraction(double value, const AxisRange& range) {
  return std::clamp((value - range.low) / (range.high - range.low), 0.0, 1.0);
}

class Scale {
 public:
  Scale(const ChartValues& values, const Rect& plot) : values_(values), plot_(plot) {}

  double x(double value) const { return plot_.x + clampedFraction(value, values_.x) * plot_.width; }
  double y(double value) const { return plot_.maxY() - clampedFraction(value, values_.y) * plot_.height; }
  Rect bar(double left, double right, double low, double high) const {
    return {x(left), y(high), x(right) - x(left), y(low) - y(high)};
  }

 private:
  const ChartValues& values_;
  const Rect& plot_;
};

std::vector<Rect> barsOf(const ChartValues& values, const Scale& scale) {
  std::vector<Rect> bars;
  for (const ChartValue& value : values.values) {
    const double margin = (value.end - value.start) * (1 - filled) / 2;
    const double foot = values.hasRanges ? value.low : std::max(values.y.low, std::min(0.0, values.y.high));
    bars.push_back(scale.bar(value.start + margin, value.end - margin, std::min(foot, value.low),
                             std::max(foot, value.high)));
  }
  return bars;
}

double usualStep(const std::vector<ChartValue>& values) {
  std::vector<double> steps;
  for (std::size_t i = 1; i < values.size(); ++i) steps.push_back(values[i].start - values[i - 1].start);
  if (steps.empty()) return 0;
  const auto middle = steps.begin() + std::ptrdiff_t(steps.size() / 2);
  std::nth_element(steps.begin(), middle, steps.end());
  return *middle;
}

std::vector<std::vector<Point>> linesOf(const ChartValues& values, const Scale& scale) {
  std::vector<std::vector<Point>> lines;
  const double longest = usualStep(values.values) * gapInSteps;
  const ChartValue* before = nullptr;
  for (const ChartValue& value : values.values) {
    const bool isGap = before == nullptr || value.isAfterGap || value.start - before->start > longest;
    if (isGap) lines.emplace_back();
    lines.back().push_back({scale.x(value.start), scale.y(value.high)});
    before = &value;
  }
  return lines;
}

// The elements that stand for what the chart shows.
std::vector<Rect> framesOfValues(const Snapshot& snapshot, const Node& chart) {
  std::vector<Rect> frames;
  for (const Node* element : elementsOfChart(snapshot, chart)) {
    if (element->role != Role::header && !element->frame.isEmpty()) frames.push_back(element->frame);
  }
  return frames;
}

}  // namespace

ChartDrawing drawChart(const DataSeries& series, const Rect& plot) {
  const ChartValues values = chartValues(series);
  const Scale scale(values, plot);
  if (values.areBars) return {plot, barsOf(values, scale), {}};
  return {plot, {}, linesOf(values, scale)};
}

ChartDrawing drawChartOnScreen(const Snapshot& snapshot, const Node& chart) {
  const std::vector<Rect> frames = framesOfValues(snapshot, chart);
  Rect plot = frames.empty() ? chart.frame : frames.front();
  for (const Rect& frame : frames) plot = plot.unionWith(frame);
  ChartDrawing drawing = drawChart(shownSeries(snapshot, chart), plot);
  if (drawing.bars.size() != frames.size()) return drawing;
  for (std::size_t i = 0; i < frames.size(); ++i) {
    drawing.bars[i].width = frames[i].width * filled;
    drawing.bars[i].x = frames[i].center().x - drawing.bars[i].width / 2;
  }
  return drawing;
}

}  // namespace ax::reader
