#include "apps/view/model/StepNote.h"

#include <algorithm>
#include <cmath>

#include "reader/snapshot/ShownSeries.h"
#include "reader/sound/ChartNotes.h"

namespace ax::view {

using reader::ChartNotes;

namespace {

// A part of the horizontal axis, from 0 to 1.
struct Span {
  double from = 0;
  double to = 0;
  double width() const { return to - from; }
};

// By their frames in the chart's; where reading begins at the right, so does the axis.
std::vector<Span> spansOf(const ScreenModel& model, const Item& chart, const std::vector<ChartStep>& steps) {
  const Rect whole = chart.node.frame;
  std::vector<Span> spans;
  for (const ChartStep& step : steps) {
    const Item* item = model.find(step.item);
    if (item == nullptr || whole.width <= 0) return {};
    const double from = (item->node.frame.x - whole.x) / whole.width;
    spans.push_back({from, from + item->node.frame.width / whole.width});
  }
  if (spans.size() > 1 && spans.front().from > spans.back().from) {
    for (Span& span : spans) span = {1 - span.to, 1 - span.from};
  }
  return spans;
}

// Texts beside the bars, and bars over each other, belong to no part of the axis.
bool areSideBySide(const std::vector<Span>& spans) {
  for (std::size_t i = 1; i < spans.size(); ++i) {
    if (spans[i].from < spans[i - 1].to - spans[i].width() / 4) return false;
  }
  return !spans.empty();
}

std::optional<StepNote> noteOfValue(const reader::DataSeries& series, const ChartNotes& notes,
                                    std::size_t at) {
  const auto& [horizontal, vertical] = series.axes;
  const double value = vertical.values[at];
  if (!std::isfinite(value)) return {};
  const std::size_t last = vertical.values.size() - 1;
  double place = last == 0 ? 0.5 : double(at) / double(last);
  if (horizontal.values.size() == vertical.values.size() && horizontal.minimum && horizontal.maximum) {
    const double length = *horizontal.maximum - *horizontal.minimum;
    if (length > 0) place = (horizontal.values[at] - *horizontal.minimum) / length;
  }
  return StepNote{notes.heightOf(value), std::isfinite(place) ? std::clamp(place, 0.0, 1.0) : 0.5};
}

// That of the values whose part of all bars lies in this one.
std::optional<StepNote> averageIn(const Span& span, const Span& all, const reader::DataSeries& series,
                                  const ChartNotes& notes) {
  const std::size_t values = series.axes[verticalAxis].values.size();
  double heights = 0, places = 0;
  int count = 0;
  for (std::size_t i = 0; i < values; ++i) {
    const double middle = std::lerp(all.from, all.to, (double(i) + 0.5) / double(values));
    if (middle < span.from || middle >= span.to) continue;
    const std::optional<StepNote> note = noteOfValue(series, notes, i);
    if (!note) continue;
    heights += note->height;
    places += note->place;
    count += 1;
  }
  if (count == 0) return {};
  return StepNote{heights / count, places / count};
}

// The values that have a bar, by their indexes.
std::vector<std::size_t> shownValues(const reader::DataSeries& series) {
  const std::vector<double>& values = series.axes[verticalAxis].values;
  std::vector<std::size_t> shown;
  for (std::size_t i = 0; i < values.size(); ++i) {
    if (std::isfinite(values[i])) shown.push_back(i);
  }
  return shown;
}

}  // namespace

std::optional<StepNote> noteOfStep(const ScreenModel& model, const Item& chart,
                                   const std::vector<ChartStep>& steps, std::size_t at) {
  const reader::Node& node = *model.snapshot().node(chart.node.id);
  const reader::DataSeries series = reader::shownSeries(model.snapshot(), node);
  const ChartNotes notes = reader::notesOfChart(model.snapshot(), node);
  if (series.axes[verticalAxis].values.size() == steps.size()) return noteOfValue(series, notes, at);
  const std::vector<std::size_t> shown = shownValues(series);
  if (shown.size() == steps.size()) return noteOfValue(series, notes, shown[at]);
  const std::vector<Span> spans = spansOf(model, chart, steps);
  if (!areSideBySide(spans)) return {};
  return averageIn(spans[at], {spans.front().from, spans.back().to}, series, notes);
}

}  // namespace ax::view
