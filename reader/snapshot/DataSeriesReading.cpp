#include "reader/snapshot/DataSeriesReading.h"

#include <algorithm>

#include "platform/toolkit/AccessibilityMessages.h"
#include "platform/toolkit/DataSeriesMessages.h"
#include "reader/snapshot/SliceChart.h"

namespace ax::reader {

namespace {

using namespace messages;

constexpr double describedPositions[] = {0, 0.25, 0.5, 0.75, 1};
// A day in seconds: no chart has a reason for more, and a host that counts wrongly must not hold us up.
constexpr std::uint64_t mostSlices = 86400;

std::optional<double> numberValue(const Ref<Number>& number) {
  return number ? std::optional(number->doubleValue()) : std::nullopt;
}

DataSeriesAxis readAxis(Object& chart, std::int64_t index, HostQuestions& questions) {
  DataSeriesAxis axis;
  axis.title = questions.askText(_accessibilityDataSeriesTitleForAxis, chart, index);
  axis.unitLabel = questions.askText(_accessibilityDataSeriesUnitLabelForAxis, chart, index);
  axis.minimum = numberValue(questions.ask(_accessibilityDataSeriesMinimumValueForAxis, chart, index));
  axis.maximum = numberValue(questions.ask(_accessibilityDataSeriesMaximumValueForAxis, chart, index));
  if (const Ref<Array> values = questions.ask(_accessibilityDataSeriesValuesForAxis, chart, index)) {
    for (const Ref<Object>& value : *values) {
      if (const Number* number = cast<Number>(value.get())) axis.values.push_back(number->doubleValue());
    }
  }
  for (const double position : describedPositions) {
    auto text =
        questions.askText(_accessibilityDataSeriesValueDescriptionForPositionAxis, chart, position, index);
    if (text) axis.positions.push_back({position, *std::move(text)});
  }
  return axis;
}

void readSeries(Object& chart, HostQuestions& questions, DataSeries& series) {
  // A chart may know its range only once it has made its elements.
  questions.ask(accessibilityElements, chart);
  series.name = questions.askText(_accessibilityDataSeriesName, chart);
  series.type = questions.ask(_accessibilityDataSeriesType, chart);
  series.supportsSummarization = questions.ask(_accessibilityDataSeriesSupportsSummarization, chart);
  series.supportsSonification = questions.ask(_accessibilityDataSeriesSupportsSonification, chart);
  for (const Axis i : {horizontalAxis, verticalAxis}) series.axes[i] = readAxis(chart, i, questions);
}

void readSlices(Object& chart, HostQuestions& questions, DataSeries& series) {
  const std::uint64_t count = std::min(questions.ask(_accessibilityNumberOfSlices, chart), mostSlices);
  series.secondsPerSlice = questions.ask(_accessibilityTimeIntervalPerSlice, chart);
  series.hoursPerSlice = questions.ask(_accessibilityHoursPerSlice, chart);
  const SliceTimes times(chart);
  for (std::uint64_t i = 0; i < count; ++i) {
    const double start = double(i) * series.secondsPerSlice, end = double(i + 1) * series.secondsPerSlice;
    series.slices.push_back({start, end, questions.askText(_accessibilityQuantityForSliceAtIndex, chart, i),
                             times.after(start), times.after(end)});
  }
}

std::optional<AttributedText> ownLabelOr(std::optional<AttributedText> name, Object& chart,
                                         HostQuestions& questions) {
  auto label = questions.askText(accessibilityLabel, chart);
  return label && !label->text.empty() ? label : name;
}

}  // namespace

std::optional<DataSeries> readDataSeries(Object& object, HostQuestions& questions) {
  DataSeries series;
  series.hasAxes = questions.ask(accessibilityContainerType, object) == dataSeriesContainerType;
  series.usesSlices = questions.ask(_accessibilityShouldUseSlices, object);
  if (!series.hasAxes && !series.usesSlices) return std::nullopt;
  if (series.hasAxes) readSeries(object, questions, series);
  if (series.usesSlices) readSlices(object, questions, series);
  if (!series.hasAxes) series.name = ownLabelOr(nameOfSliceChart(object, questions), object, questions);
  return series;
}

}  // namespace ax::reader
