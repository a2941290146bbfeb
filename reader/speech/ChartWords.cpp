#include "reader/speech/ChartWords.h"

#include "platform/formatting/Numbers.h"
#include "platform/health/Unit.h"
#include "reader/snapshot/Charts.h"
#include "reader/speech/SpokenTime.h"
#include "reader/text/ReaderStrings.h"

namespace ax::reader {

std::string spokenFigure(double value) {
  return formatting::decimalString(value, 2);
}

std::string nameOfChart(const Snapshot& snapshot, const Node& chart) {
  std::string name = withSpokenTimes(chart.series->name);
  if (name.empty()) name = withSpokenTimes(chart.label);
  for (const Node* element : elementsOfChart(snapshot, chart)) {
    if (name.empty() && element->role == Role::header) name = withSpokenTimes(element->label);
  }
  return name;
}

std::string headingOf(const Snapshot& snapshot, const Node& chart) {
  const std::string name = nameOfChart(snapshot, chart);
  return name.empty() ? readerText("chart.untitled") : readerText("chart.title", {name});
}

std::string unitName(const DataSeriesAxis& axis) {
  const std::string name = withSpokenTimes(axis.unitLabel);
  const Ref<Unit> unit = Unit::unitFromString(name);
  return unit ? unit->description() : name;
}

std::string unitOf(const DataSeriesAxis& axis) {
  const std::string name = unitName(axis);
  return name.empty() ? name : readerText("chart.unit", {name});
}

std::string rangeOf(std::optional<double> minimum, std::optional<double> maximum) {
  if (minimum && maximum) return readerText("chart.range", {spokenFigure(*minimum), spokenFigure(*maximum)});
  if (minimum) return readerText("chart.lowest", {spokenFigure(*minimum)});
  return maximum ? readerText("chart.highest", {spokenFigure(*maximum)}) : std::string();
}

}  // namespace ax::reader
