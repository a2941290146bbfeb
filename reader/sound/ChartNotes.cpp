#include "reader/sound/ChartNotes.h"

#include <algorithm>
#include <cmath>

#include "reader/snapshot/ShownSeries.h"
#include "reader/speech/SliceQuantity.h"

namespace ax::reader {

namespace {

constexpr double longestRest = 5;  // steps

struct Point {
  double x;
  std::optional<double> value;
};
using Points = std::vector<Point>;

bool isFinite(const std::optional<double>& number) {
  return number && std::isfinite(*number);
}

// Where a number lies between two others, which do not overflow here.
double fraction(double number, double from, double to) {
  return std::clamp((number / 2 - from / 2) / (to / 2 - from / 2), 0.0, 1.0);
}

Points pointsOf(const DataSeries& series) {
  const auto& [horizontal, vertical] = series.axes;
  const bool hasPlaces = horizontal.values.size() == vertical.values.size() &&
                         std::ranges::all_of(horizontal.values, [](double x) { return std::isfinite(x); });
  Points points;
  for (std::size_t i = 0; i < vertical.values.size(); ++i) {
    points.push_back({hasPlaces ? horizontal.values[i] : double(i), vertical.values[i]});
    if (!isFinite(points.back().value)) points.back().value.reset();
  }
  std::ranges::stable_sort(points, {}, &Point::x);
  return points;
}

// What most values keep between each other; 0 where they keep nothing.
double regularStep(const Points& points) {
  std::vector<double> steps;
  for (std::size_t i = 1; i < points.size(); ++i) steps.push_back(points[i].x - points[i - 1].x);
  if (steps.empty()) return 0;
  std::ranges::nth_element(steps, steps.begin() + std::ptrdiff_t(steps.size() / 2));
  const double median = steps[steps.size() / 2];
  const auto regular =
      std::ranges::count_if(steps, [&](double step) { return step > median / 2 && step < median * 1.5; });
  return std::size_t(regular) * 4 >= steps.size() * 3 ? median : 0;
}

// A point without a value for each step that is left out; long gaps become shorter.
Points withMissedSteps(const Points& points) {
  const double step = regularStep(points);
  Points filled;
  for (const Point& point : points) {
    const double gap = filled.empty() || step <= 0 ? 0 : point.x - filled.back().x;
    const int missed = step <= 0 ? 0 : int(std::clamp(std::round(gap / step) - 1, 0.0, longestRest));
    const double from = filled.empty() ? point.x : filled.back().x;
    for (int i = 1; i <= missed; ++i) filled.push_back({from + gap * i / (missed + 1), {}});
    filled.push_back(point);
  }
  return filled;
}

// Points of equal length of time that hold the averages of the values in them.
Points averagedPoints(const Points& points) {
  const double first = points.front().x, last = points.back().x;
  std::vector<std::vector<double>> columns(mostNotes);
  for (std::size_t i = 0; i < points.size(); ++i) {
    const double place =
        last > first ? fraction(points[i].x, first, last) : double(i) / double(points.size());
    const auto column = std::min(std::size_t(place * mostNotes), mostNotes - 1);
    if (points[i].value) columns[column].push_back(*points[i].value);
  }
  Points averages;
  for (std::size_t i = 0; i < mostNotes; ++i) {
    averages.push_back({std::lerp(first, last, (double(i) + 0.5) / mostNotes), {}});
    if (columns[i].empty()) continue;
    double average = 0;
    for (const double value : columns[i]) average += value / double(columns[i].size());
    averages.back().value = average;
  }
  return averages;
}

// Two points for each slice; of many slices, for each of the spans that hold them.
Points slicePoints(const DataSeries& series) {
  const std::vector<std::optional<SliceQuantity>> values = sliceQuantities(series);
  Points lows, highs;
  for (std::size_t i = 0; i < values.size(); ++i) {
    const double middle = (series.slices[i].start + series.slices[i].end) / 2;
    lows.push_back({middle, values[i] ? std::optional(values[i]->low) : std::nullopt});
    highs.push_back({middle, values[i] ? std::optional(values[i]->high) : std::nullopt});
  }
  if (values.size() > mostNotes) {
    lows = averagedPoints(lows);
    highs = averagedPoints(highs);
  }
  Points both;
  for (std::size_t i = 0; i < lows.size(); ++i) both.insert(both.end(), {lows[i], highs[i]});
  return both;
}

void setRange(const DataSeriesAxis& axis, const Points& points, ChartNotes& notes) {
  std::vector<double> values;
  for (const Point& point : points) {
    if (point.value) values.push_back(*point.value);
  }
  if (values.empty()) values = {0};
  notes.minimum = isFinite(axis.minimum) ? *axis.minimum : *std::ranges::min_element(values);
  notes.maximum = isFinite(axis.maximum) ? *axis.maximum : *std::ranges::max_element(values);
}

void addNotes(double first, double last, const Points& points, ChartNotes& notes) {
  for (const Point& point : points) {
    notes.notes.push_back({point.value, last > first ? fraction(point.x, first, last) : 0.5});
  }
}

ChartNotes notesOfSlices(const DataSeries& series) {
  ChartNotes notes;
  const Points points = slicePoints(series);
  setRange({}, points, notes);
  addNotes(series.slices.front().start, series.slices.back().end, points, notes);
  if (series.slices.size() > mostNotes) notes.averaged = series.slices.size();
  return notes;
}

}  // namespace

double ChartNotes::heightOf(double value) const {
  return maximum > minimum ? fraction(value, minimum, maximum) : 0;
}

bool playsSlices(const DataSeries& series) {
  return series.usesSlices && !series.slices.empty() && series.axes[verticalAxis].values.empty();
}

ChartNotes notesOfChart(const Snapshot& snapshot, const Node& chart) {
  const DataSeries& series = *chart.series;
  if (playsSlices(series)) return notesOfSlices(series);
  ChartNotes notes;
  const Points values = pointsOf(shownSeries(snapshot, chart));
  if (values.empty()) return notes;
  const bool isAveraged = values.size() > mostNotes;
  if (isAveraged) notes.averaged = values.size();
  const Points points = isAveraged ? averagedPoints(values) : withMissedSteps(values);
  setRange(series.axes[verticalAxis], points, notes);
  const DataSeriesAxis& axis = series.axes[horizontalAxis];
  const bool hasAxis = isFinite(axis.minimum) && isFinite(axis.maximum) && !axis.values.empty();
  const double first = hasAxis ? *axis.minimum : values.front().x;
  addNotes(first, hasAxis ? *axis.maximum : values.back().x, points, notes);
  return notes;
}

}  // namespace ax::reader
