#include "apps/view/model/StepNote.h"

#include <algorithm>
#include <cmath>

#include "reader/sound/ChartNotes.h"

namespace ax::view {

using reader::ChartNote;
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

// Values stand for what follows them, and frames are whole pixels.
bool holds(const Span& span, double place) {
  const double inside = place + span.width() / 4;
  return inside >= span.from && inside < span.to;
}

std::optional<StepNote> averageIn(const Span& span, const ChartNotes& notes) {
  double sum = 0;
  int count = 0;
  for (const ChartNote& note : notes.notes) {
    if (!note.value || !holds(span, note.place)) continue;
    sum += notes.heightOf(*note.value);
    count += 1;
  }
  if (count == 0) return {};
  return StepNote{sum / count, std::clamp(span.from + span.width() / 2, 0.0, 1.0)};
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

}  // namespace

std::optional<StepNote> noteOfStep(const ScreenModel& model, const Item& chart,
                                   const std::vector<ChartStep>& steps, std::size_t at) {
  const reader::DataSeries& series = *chart.node.series;
  const ChartNotes notes = reader::notesOfChart(model.snapshot(), *model.snapshot().node(chart.node.id));
  if (series.axes[1].values.size() == steps.size()) return noteOfValue(series, notes, at);
  const std::vector<Span> spans = spansOf(model, chart, steps);
  return areSideBySide(spans) ? averageIn(spans[at], notes) : std::nullopt;
}

}  // namespace ax::view
