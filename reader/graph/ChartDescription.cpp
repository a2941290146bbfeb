#include "reader/graph/ChartDescription.h"

#include "platform/formatting/Dates.h"
#include "platform/formatting/Durations.h"
#include "platform/formatting/Numbers.h"
#include "reader/snapshot/Charts.h"
#include "reader/speech/ChartWords.h"
#include "reader/speech/SpokenLine.h"
#include "reader/speech/SpokenTime.h"
#include "reader/text/ReaderStrings.h"

namespace ax::reader {

namespace {

using Lines = std::vector<std::string>;

constexpr std::string_view axisKeys[] = {"chart.axis.x", "chart.axis.y"};
constexpr std::string_view once = "  ";
constexpr std::string_view twice = "    ";

void add(Lines& lines, std::string_view indent, const std::string& text) {
  if (!text.empty()) lines.push_back(std::string(indent) + text);
}

std::string count(std::string_view key, std::size_t number) {
  return readerText(key, {static_cast<std::int64_t>(number)});
}

// Kept apart by a mark that is no decimal sign in any language.
std::string separatedFigures(const Lines& figures) {
  std::string text;
  for (const std::string& figure : figures) text += (text.empty() ? "" : "; ") + figure;
  return text;
}

void addAxis(const DataSeriesAxis& axis, std::string_view key, Lines& lines) {
  add(lines, once,
      readerText(key, {joined({withSpokenTimes(axis.title), unitOf(axis), rangeOf(axis.minimum, axis.maximum),
                               count("chart.values", axis.values.size())})}));
  Lines values;
  for (const double value : axis.values) values.push_back(spokenFigure(value));
  add(lines, twice, separatedFigures(values));
  for (const auto& [position, text] : axis.positions) {
    add(lines, twice,
        readerText("chart.position", {formatting::percentString(position), withSpokenTimes(text)}));
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
                readerText("chart.frame", {spokenFigure(frame.x), spokenFigure(frame.y),
                                           spokenFigure(frame.width), spokenFigure(frame.height)})}));
  }
}

void addSlices(const DataSeries& series, Lines& lines) {
  if (!series.usesSlices) return;
  add(lines, once,
      joined({count("chart.slices", series.slices.size()),
              readerText("chart.slice.duration", {formatting::spokenDuration(series.secondsPerSlice)})}));
  for (std::size_t i = 0; i < series.slices.size(); ++i) add(lines, twice, describeSlice(series, i));
}

}  // namespace

std::string spokenSpan(const DataSlice& slice) {
  if (!slice.startTime || !slice.endTime) {
    return readerText("chart.range",
                      {formatting::spokenDuration(slice.start), formatting::spokenDuration(slice.end)});
  }
  // Shorter slices can begin and end in the same minute.
  constexpr double minute = 60;
  const std::string_view clock = slice.end - slice.start < minute ? "h:mm:ssa" : "h:mma";
  return readerText("chart.range", {formatting::dateString(*slice.startTime, clock),
                                    formatting::dateString(*slice.endTime, clock)});
}

std::string describeSlice(const DataSeries& series, std::size_t index) {
  if (index >= series.slices.size()) return "";
  const DataSlice& slice = series.slices[index];
  const std::string quantity = withSpokenTimes(slice.quantity);
  return joined({readerText("chart.slice", {static_cast<std::int64_t>(index) + 1, spokenSpan(slice)}),
                 quantity.empty() ? readerText("chart.no.data") : quantity});
}

std::vector<std::string> describeChart(const Snapshot& snapshot, const Node& chart) {
  const DataSeries& series = *chart.series;
  const auto elements = elementsOfChart(snapshot, chart);
  Lines lines = {headingOf(snapshot, chart)};
  addSeries(series, lines);
  addElements(elements, lines);
  addSlices(series, lines);
  const bool hasData = !series.axes[horizontalAxis].values.empty() ||
                       !series.axes[verticalAxis].values.empty() || !elements.empty() ||
                       !series.slices.empty();
  if (!hasData) add(lines, once, readerText("chart.no.data"));
  return lines;
}

}  // namespace ax::reader
