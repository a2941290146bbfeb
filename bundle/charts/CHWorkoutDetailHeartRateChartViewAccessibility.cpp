#include <cmath>
#include <limits>

#include "bundle/charts/DataSeriesChart.h"
#include "bundle/charts/Extremes.h"
#include "bundle/charts/Slices.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/foundation/Calendar.h"
#include "platform/foundation/Formatters.h"
#include "platform/health/Workout.h"
#include "platform/runtime/Boxing.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

constinit const Message<Ref<DateInterval>()> axDateInterval{"_axDateInterval"};
constinit const Message<float(Ref<Date>)> decimalForDate{"_decimalForDate:"};

Ref<String> spokenRate(double rate) {
  return formatFloat(FloatFormat::whole, static_cast<float>(rate));
}

Ref<String> spokenRange(const Extremes& range) {
  if (range.isIncomplete()) return nullptr;
  if (std::abs(range.maximum - range.minimum) < std::numeric_limits<double>::epsilon()) {
    return stringWithFormat(accessibilityLocalizedString("heart.rate.graph.single"),
                            {spokenRate(range.maximum)});
  }
  return stringWithFormat(accessibilityLocalizedString("heart.rate.graph.range"),
                          {spokenRate(range.minimum), spokenRate(range.maximum)});
}

float unsignedAsFloat(const Ref<Object>& object, Key key) {
  const Ref<Number> value = cast<Number>(safeValueForKey(object, key));
  return value ? static_cast<float>(value->unsignedValue()) : 0;
}

// The middle of what a point of the chart spans.
float middleOf(const Ref<Object>& point) {
  const Ref<Object> span = safeValueForKey(point, "yValue"_key);
  return (unsignedAsFloat(span, "firstIndex"_key) + unsignedAsFloat(span, "lastIndex"_key)) * 0.5f;
}

// A workout's heart rate over the time of day, summed up in equal slices of the workout.
class CHWorkoutDetailHeartRateChartViewAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.conformsTo("VLUIChartDataSource");
    contract.instanceVariable("_heartRateReadings", "Array");
    contract.instanceVariable("_heartRateChartPoints", "Array");
    contract.instanceVariable("_chartView", "VLUIChartView");
    contract.instanceVariable("_hasAdequateDataForDisplay", "B");
    contract.instanceMethod("_dateInterval", {"@"});
    contract.of("Quantity").instanceMethod("ch_beatsPerMinute", {"d"});
  }

  Ref<Array> accessibilityElements() {
    const Ref<Object> chart = self.safeValueForKey("_chartView"_key);
    return axArrayByIgnoringNilElementsWithCount(1, {safeUIViewForKey(chart, "_containerView"_key)});
  }

  std::int64_t accessibilityContainerType() { return messages::dataSeriesContainerType; }
  bool _accessibilityDataSeriesSupportsSummarization() { return true; }
  bool _accessibilityDataSeriesSupportsSonification() { return true; }
  std::int64_t _accessibilityDataSeriesType() { return lineSeries; }
  Ref<String> _accessibilityDataSeriesName() {
    return accessibilityLocalizedString("heart.rate.data.series");
  }
  Ref<String> _accessibilityDataSeriesTitleForAxis(std::int64_t axis) {
    return localizedTextForAxis(axis, "activity.time.of.day.axis", "heart.rate.data.series");
  }
  Ref<String> _accessibilityDataSeriesUnitLabelForAxis(std::int64_t axis) {
    return localizedTextForAxis(axis, "activity.time.of.day.unit", "heart.rate.data.unit");
  }

  // A point of a wrong kind counts as one at nothing, so that both axes keep one value per point.
  Ref<Array> _accessibilityDataSeriesValuesForAxis(std::int64_t axis) {
    Array::Items values;
    const Ref<Array> points = safeArrayForKey(self, "_heartRateChartPoints"_key);
    if (!points || !isAxis(axis)) return array({});
    values.reserve(points->count());
    for (const Ref<Object>& item : *points) {
      const Ref<Object> point = safeClass("VLUIChartPointMultiple"_key, item);
      const auto hour = [&] {
        return decimalForDate(self, cast<Date>(safeValueForKey(point, "xValue"_key)));
      };
      values.push_back(number(axis == horizontalAxis ? hour() : middleOf(point)));
    }
    return array(std::move(values));
  }

  Ref<Number> _accessibilityDataSeriesMinimumValueForAxis(std::int64_t axis) {
    const Ref<DateInterval> workout = axis == horizontalAxis ? axDateInterval(self) : nullptr;
    if (axis == horizontalAxis) return number(decimalForDate(self, workout ? workout->startDate() : nullptr));
    return axis == verticalAxis ? endOfRange("minYValue"_key) : nullptr;
  }

  Ref<Number> _accessibilityDataSeriesMaximumValueForAxis(std::int64_t axis) {
    const Ref<DateInterval> workout = axis == horizontalAxis ? axDateInterval(self) : nullptr;
    if (axis == horizontalAxis) return number(decimalForDate(self, workout ? workout->endDate() : nullptr));
    return axis == verticalAxis ? endOfRange("maxYValue"_key) : nullptr;
  }

  bool _accessibilityShouldUseSlices() { return self.safeBoolForKey("_hasAdequateDataForDisplay"_key); }
  std::uint64_t _accessibilityNumberOfSlices() { return sliceCount; }

  double _accessibilityTimeIntervalPerSlice() {
    const Ref<DateInterval> workout = axDateInterval(self);
    const std::uint64_t slices = messages::_accessibilityNumberOfSlices(self);
    return workout && slices > 0 ? workout->duration() / static_cast<double>(slices) : 0;
  }

  std::uint64_t _accessibilityHoursPerSlice() {
    const Ref<DateInterval> workout = axDateInterval(self);
    const std::uint64_t slices = messages::_accessibilityNumberOfSlices(self);
    if (!workout || slices == 0) return 0;
    return number(workout->duration() / 3600 / static_cast<double>(slices))->unsignedValue();
  }

  // Both ends of the slice are counted from the workout's start, so that neighbours share theirs exactly.
  Ref<String> _accessibilityQuantityForSliceAtIndex(std::uint64_t index) {
    const Ref<DateInterval> workout = axDateInterval(self);
    if (!workout || index >= messages::_accessibilityNumberOfSlices(self)) return nullptr;
    const TimeInterval length = messages::_accessibilityTimeIntervalPerSlice(self);
    const auto slice = static_cast<double>(index);
    const double start = workout->startDate()->timeIntervalSince1970();
    return spokenRange(ratesBetween(start + length * slice, start + length * (slice + 1)));
  }

  Ref<DateInterval> _axDateInterval() {
    return castAsClass<DateInterval>(self.safeValueForKeyPath("dateInterval"));
  }

  // 0 for no date.
  float _decimalForDate(Ref<Date> date) {
    if (!date) return 0;
    const Ref<DateComponents> time = Calendar::currentCalendar()->componentsFromDate(*date);
    return static_cast<float>(time->hour + time->minute / 60.0 + time->second / 3600.0);
  }

 private:
  Ref<Number> endOfRange(Key key) {
    const Ref<Object> chart = safeClass("VLUIChartView"_key, self.safeValueForKey("_chartView"_key));
    return cast<Number>(safeValueForKey(chart, key));
  }

  // Of the whole heart rates in a stretch of time, both ends included.
  Extremes ratesBetween(double start, double end) {
    Extremes range;
    const Ref<Array> readings = safeArrayForKey(self, "_heartRateReadings"_key);
    if (!readings) return range;
    const Class& readingClass = HeartRateSummaryReading::staticClass();
    for (const Ref<Object>& item : *readings) {
      if (&item->isa() != &readingClass && !castAsClass<HeartRateSummaryReading>(item)) continue;
      const auto& reading = static_cast<const HeartRateSummaryReading&>(*item);
      if (!reading.date()) continue;
      const double time = reading.date()->timeIntervalSince1970();
      if (start <= time && time <= end) range.include(rateOf(reading));
    }
    return range;
  }

  static double rateOf(const HeartRateSummaryReading& reading) {
    const Ref<Quantity>& rate = reading.quantity();
    return rate ? std::round(rate->safeDoubleForKey("ch_beatsPerMinute"_key)) : 0;
  }
};

}  // namespace

AX_CATEGORY(CHWorkoutDetailHeartRateChartViewAccessibility, "CHWorkoutDetailHeartRateChartView",
            overrides<&C::_axDateInterval>(axDateInterval), overrides<&C::_decimalForDate>(decimalForDate))

}  // namespace ax
