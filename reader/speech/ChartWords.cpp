#include "reader/speech/ChartWords.h"

#include "platform/formatting/Numbers.h"
#include "platform/health/Unit.h"
#include "reader/speech/SpokenTime.h"
#include "reader/text/ReaderStrings.h"

namespace ax::reader {

std::string spokenFigure(double value) {
  return formatting::decimalString(value, 2);
}

std::string chartText(const std::optional<AttributedText>& text) {
  return text ? withSpokenTimes(*text) : std::string();
}

std::string headingOf(const Node& chart) {
  std::string name = chartText(chart.series->name);
  if (name.empty()) name = chartText(chart.label);
  return name.empty() ? readerText("chart.untitled") : readerText("chart.title", {name});
}

std::string unitOf(const DataSeriesAxis& axis) {
  std::string name = chartText(axis.unitLabel);
  if (const Ref<Unit> unit = Unit::unitFromString(name)) name = unit->description();
  return name.empty() ? name : readerText("chart.unit", {name});
}

std::string rangeOf(std::optional<double> minimum, std::optional<double> maximum) {
  if (minimum && maximum) return readerText("chart.range", {spokenFigure(*minimum), spokenFigure(*maximum)});
  if (minimum) return readerText("chart.lowest", {spokenFigure(*minimum)});
  return maximum ? readerText("chart.highest", {spokenFigure(*maximum)}) : std::string();
}

}  // namespace ax::reader
