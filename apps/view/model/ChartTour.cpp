#include "apps/view/model/ChartTour.h"

#include "platform/formatting/Numbers.h"
#include "reader/graph/ChartDescription.h"
#include "reader/snapshot/Charts.h"
#include "reader/text/ReaderStrings.h"

namespace ax::view {

using reader::Node;
using reader::readerText;

namespace {

std::vector<ChartStep> valueSteps(const Item& chart) {
  const reader::DataSeriesAxis& axis = chart.node.series->axes[verticalAxis];
  std::vector<ChartStep> steps;
  for (std::size_t i = 0; i < axis.values.size(); ++i) {
    std::string value = formatting::decimalString(axis.values[i], 2);
    if (axis.unitLabel) value += " " + axis.unitLabel->text;
    const std::string place =
        readerText("position.of", {std::int64_t(i + 1), std::int64_t(axis.values.size())});
    steps.push_back({0, reader::joined({value, place})});
  }
  return steps;
}

}  // namespace

std::vector<ChartStep> stepsOfChart(const ScreenModel& model, const Item& chart) {
  std::vector<ChartStep> steps;
  const Node* node = model.snapshot().node(chart.node.id);
  for (const Node* element : reader::elementsOfChart(model.snapshot(), *node)) {
    const Item* item = model.find(model.itemOf(element->id));
    if ((element->traits & TraitHeader) != 0 || item->line.empty()) continue;
    steps.push_back({item->id});
  }
  return steps.empty() && chart.node.series ? valueSteps(chart) : steps;
}

std::string sliceLine(const Item& chart, std::size_t slice) {
  return chart.node.series ? reader::describeSlice(*chart.node.series, slice) : "";
}

bool isFirstIn(const ScreenModel& model, ItemId chart, ItemId item) {
  const ItemId before = model.neighbour(item, -1, [](const Item&) { return true; });
  return before == 0 || model.chartAround(before) != chart;
}

void ChartTour::enter(const ScreenModel& model, ItemId chart, ItemId focus) {
  chart_ = chart;
  steps_ = stepsOfChart(model, *model.find(chart));
  at_ = -1;
  for (std::size_t i = 0; i < steps_.size(); ++i) {
    if (steps_[i].item == focus) at_ = std::ptrdiff_t(i);
  }
}

const ChartStep* ChartTour::step(const ScreenModel& model, ItemId focus, int direction) {
  const ItemId chart = model.chartAround(focus);
  if (chart == 0) return nullptr;
  if (chart != chart_) enter(model, chart, focus);
  const std::ptrdiff_t next = at_ + direction;
  if (next < 0 || next >= std::ptrdiff_t(steps_.size())) return nullptr;
  at_ = next;
  return &steps_[std::size_t(at_)];
}

}  // namespace ax::view
