#include "reader/graph/ChartDescription.h"

#include "platform/formatting/Durations.h"
#include "platform/formatting/Numbers.h"
#include "reader/ReaderStrings.h"
#include "reader/transcript/SpokenTime.h"
#include "reader/transcript/Transcript.h"

namespace ax::reader {

namespace {

using Lines = std::vector<std::string>;

constexpr std::string_view axisKeys[] = {"chart.axis.x", "chart.axis.y"};
constexpr std::string_view once = "  ";
constexpr std::string_view twice = "    ";

std::string number(double value) {
  return formatting::decimalString(value, 2);
}

std::string words(const std::optional<AttributedText>& text) {
  return text ? withSpokenTimes(*text) : std::string();
}

std::string named(std::string_view key, const std::string& text) {
  return text.empty() ? std::string() : readerText(key, {text});
}

void add(Lines& lines, std::string_view indent, const std::string& text) {
  if (!text.empty()) lines.push_back(std::string(indent) + text);
}

std::string count(std::string_view key, std::size_t number) {
  return readerText(key, {static_cast<std::int64_t>(number)});
}

std::string heading(const Node& chart) {
  std::string name = words(chart.series->name);
  if (name.empty()) name = words(chart.label);
  return name.empty() ? readerText("chart.untitled") : readerText("chart.title", {name});
}

std::string range(const DataSeriesAxis& axis) {
  if (axis.minimum && axis.maximum) {
    return readerText("chart.range", {number(*axis.minimum), number(*axis.maximum)});
  }
  if (axis.minimum) return readerText("chart.lowest", {number(*axis.minimum)});
  return axis.maximum ? readerText("chart.highest", {number(*axis.maximum)}) : std::string();
}

// Kept apart by a mark that is no decimal sign in any language.
std::string separatedFigures(const Lines& figures) {
  std::string text;
  for (const std::string& figure : figures) text += (text.empty() ? "" : "; ") + figure;
  return text;
}

void addAxis(const DataSeriesAxis& axis, std::string_view key, Lines& lines) {
  add(lines, once,
      readerText(key, {joined({words(axis.title), named("chart.unit", words(axis.unitLabel)), range(axis),
                               count("chart.values", axis.values.size())})}));
  Lines values;
  for (const double value : axis.values) values.push_back(number(value));
  add(lines, twice, separatedFigures(values));
  for (const auto& [position, text] : axis.positions) {
    add(lines, twice, readerText("chart.position", {formatting::percentString(position), words(text)}));
  }
}

void addSeries(const DataSeries& series, Lines& lines) {
  if (!series.hasAxes) return;
  add(lines, once,
      joined({readerText("chart.type", {series.type}),
              series.supportsSummarization ? readerText("chart.summarization") : "",
              series.supportsSonification ? readerText("chart.sonification") : ""}));
  for (std::size_t i = 0; i < series.axes.size(); ++i) addAxis(series.axes[i], axisKeys[i], lines);
}

void addElements(const std::vector<const Node*>& elements, Lines& lines) {
  if (elements.empty()) return;
  add(lines, once, count("chart.elements", elements.size()));
  for (const Node* element : elements) {
    const Rect& frame = element->frame;
    add(lines, twice,
        joined({spokenLine(*element),
                readerText("chart.frame",
                           {number(frame.x), number(frame.y), number(frame.width), number(frame.height)})}));
  }
}

void addSlices(const DataSeries& series, Lines& lines) {
  if (!series.usesSlices) return;
  const auto hours = static_cast<std::int64_t>(series.hoursPerSlice);
  const bool isWholeHours = hours > 0 && static_cast<double>(hours) * 3600 == series.secondsPerSlice;
  add(lines, once,
      joined({count("chart.slices", series.slices.size()),
              isWholeHours ? readerText("chart.slice.hours", {hours})
                           : formatting::spokenDuration(series.secondsPerSlice)}));
  std::int64_t index = 0;
  for (const DataSlice& slice : series.slices) {
    const std::string from = formatting::spokenDuration(slice.start),
                      to = formatting::spokenDuration(slice.end);
    const std::string quantity = words(slice.quantity);
    add(lines, twice,
        joined({readerText("chart.slice", {++index, readerText("chart.range", {from, to})}),
                quantity.empty() ? readerText("chart.no.data") : quantity}));
  }
}

}  // namespace

std::vector<std::string> describeChart(const Snapshot& snapshot, const Node& chart) {
  const DataSeries& series = *chart.series;
  const auto elements = elementsOfChart(snapshot, chart);
  Lines lines = {heading(chart)};
  addSeries(series, lines);
  addElements(elements, lines);
  addSlices(series, lines);
  const bool hasData = !series.axes[0].values.empty() || !series.axes[1].values.empty() ||
                       !elements.empty() || !series.slices.empty();
  if (!hasData) add(lines, once, readerText("chart.no.data"));
  return lines;
}

}  // namespace ax::reader
