#include <cmath>

#include "bundle/charts/TrendChart.h"
#include "bundle/shared/LocalizedString.h"
#include "bundle/shared/Week.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/Boxing.h"

namespace ax {

namespace {

constexpr int lastDay = int(daysOfWeek) - 1;

constinit const Message<Ref<Quantity>(std::int32_t)> quantity365ForIndex{"accessibiliytQuantity365ForIndex:"};
constinit const Message<Ref<Quantity>(std::int32_t)> quantity90ForIndex{"accessibiliytQuantity90ForIndex:"};
constinit const Message<Ref<Object>(std::int32_t)> accessibilityDayForStopIndex{
    "accessibilityDayForStopIndex:"};
constinit const Message<std::int32_t()> intValue{"intValue"};
constinit const Message<Ref<String>(std::int64_t, Ref<DateFormatter>)> axLabelForIndex{
    "_axLabelForIndex:withFormatter:"};
constinit const Message<Ref<String>(std::int64_t, Ref<DateFormatter>)> axDayStringForIndex{
    "_axDayStringForIndex:withFormatter:"};

// A trend by day of the week: the title as a header, then one element per day with both averages. As a
// series it has two bars a day, the longer average before the shorter.
class TrendDetailDailyAverageViewAccessibility : public TrendChart<TrendDetailDailyAverageViewAccessibility> {
 public:
  static GraphSource graphSource() {
    return {"dayStops"_key, "kAXTrendDetailDailyAveragesGraphElements"_key, &Number::staticClass()};
  }
  static RangeKeys rangeKeys() {
    return {"kAXTrendDailyDetailGraphCachedMin"_key, "kAXTrendDailyDetailGraphCachedMax"_key};
  }

  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("accessibiliytQuantity365ForIndex:", {"@", "i"});
    contract.instanceMethod("accessibiliytQuantity90ForIndex:", {"@", "i"});
    contract.instanceMethod("accessibilityDayForStopIndex:", {"@", "i"});
    contract.instanceMethod("layoutSubviews", {"v"});
    contract.instanceMethod("titleLabel", {"@"});
    contract.instanceMethod("dayStops", {"@"});
    contract.instanceMethod("accessibilityUnit", {"@"});
  }

  Ref<String> _accessibilityDataSeriesTitleForAxis(std::int64_t axis) {
    if (axis == horizontalAxis) return accessibilityLocalizedString("trend.daily.axis");
    return axis == verticalAxis ? trendUnitString(self) : nullptr;
  }

  Ref<String> _accessibilityDataSeriesUnitLabelForAxis(std::int64_t axis) {
    return axis == verticalAxis ? trendUnitString(self) : nullptr;
  }

  Ref<Number> lastColumn() { return number(lastDay); }

  Ref<Array> _accessibilityDataSeriesValuesForAxis(std::int64_t axis) {
    const Ref<Unit> unit = trendUnit(self);
    Array::Items values;
    for (std::size_t day = 0; day < daysOfWeek && isAxis(axis); ++day) {
      const auto place = static_cast<double>(day);
      values.push_back(number(axis == horizontalAxis ? place : average(quantity365ForIndex, day, unit)));
      values.push_back(number(axis == horizontalAxis ? place + 0.1 : average(quantity90ForIndex, day, unit)));
    }
    return array(std::move(values));
  }

  Ref<String> _accessibilityDataSeriesValueDescriptionForPositionAxis(double position, std::int64_t axis) {
    if (axis == horizontalAxis)
      return axDayStringForIndex(self, nearestColumn(position * lastDay), make<DateFormatter>());
    const Ref<Unit> unit = axis == verticalAxis ? trendUnit(self) : nullptr;
    return unit ? spokenFigureInRange(self, rangeKeys(), position, unit) : nullptr;
  }

  Ref<String> _axDayStringForIndexWithFormatter(std::int64_t index, Ref<DateFormatter> formatter) {
    std::int32_t weekday = 0;
    performSafeBlock(
        [&] { weekday = intValue(accessibilityDayForStopIndex(self, static_cast<std::int32_t>(index))); });
    if (weekday < 1 || !formatter) return nullptr;
    return cast<String>(formatter->weekdaySymbols()->at(static_cast<std::size_t>(weekday) - 1));
  }

  Ref<String> _axLabelForIndexWithFormatter(std::int64_t index, Ref<DateFormatter> formatter) {
    const Ref<Unit> unit = trendUnit(self);
    if (!unit) return nullptr;
    const Ref<String> day = axDayStringForIndex(self, index, formatter);
    const double average90 = average(quantity90ForIndex, static_cast<std::size_t>(index), unit);
    const double average365 = average(quantity365ForIndex, static_cast<std::size_t>(index), unit);
    widenRange(average90, average365);
    return stringForVariables({day, accessibilityLocalizedString("trends.365.day.average"),
                               spokenFigure(average365, unit),
                               accessibilityLocalizedString("trends.90.day.average"),
                               spokenFigure(average90, unit), stringForVariablesSentinel});
  }

  void addColumns(MutableArray& elements, double titleHeight) {
    const Ref<DateFormatter> formatter = make<DateFormatter>();
    const Ref<View> view = castAsClass<View>(self);
    const Ref<Array> stops = messages::_accessibilityGraphData(self);
    if (!view || !stops || stops->count() != daysOfWeek) return;
    const double top = 2 * titleHeight;
    const double height = std::floor(static_cast<float>(messages::frame(view).height)) - top;
    const float width = unbox<float>(stops->at(1)) - unbox<float>(stops->at(0));
    for (std::size_t i = 0; i < daysOfWeek; ++i) {
      const Ref<String> label = axLabelForIndex(self, static_cast<std::int64_t>(i), formatter);
      const Rect frame = {unbox<float>(stops->at(i)), top, width, height};
      if (label) elements.axSafelyAddObject(chartElement(self, frame, label, nullptr));
    }
  }

 private:
  double average(const Message<Ref<Quantity>(std::int32_t)>& which, std::size_t day, const Ref<Unit>& unit) {
    return roundedToHundredths(figureInUnit(answerForColumn(which, self, day), unit));
  }

  // Beside a figure that is no number the other one counts alone.
  void widenRange(double a, double b) {
    if (std::isnan(a) && std::isnan(b)) return;
    keepIf<std::greater<>>(rangeKeys().minimum, std::fmin(a, b));
    keepIf<std::less<>>(rangeKeys().maximum, std::fmax(a, b));
  }

  template <class Outdone>
  void keepIf(Key key, double figure) {
    const Ref<Object> kept = self._accessibilityValueForKey(key);
    if (kept && !Outdone()(unboxDouble(kept), figure)) return;
    self._accessibilitySetRetainedValueForKey(number(figure), key);
  }
};

}  // namespace

AX_CATEGORY(TrendDetailDailyAverageViewAccessibility, "Velto.TrendDetailDailyAverageView",
            overrides<&C::_accessibilityGraphData>(messages::_accessibilityGraphData),
            overrides<&C::_axLabelForIndexWithFormatter>(axLabelForIndex),
            overrides<&C::_axDayStringForIndexWithFormatter>(axDayStringForIndex))

}  // namespace ax
