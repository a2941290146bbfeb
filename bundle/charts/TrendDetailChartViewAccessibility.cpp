#include <cmath>

#include "bundle/charts/Extremes.h"
#include "bundle/charts/TrendChart.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/foundation/Formatters.h"
#include "platform/toolkit/Label.h"

namespace ax {

namespace {

constinit const Message<Ref<Quantity>(std::int32_t)> accessibilityQuantityForIndex{
    "accessibilityQuantityForIndex:"};
constinit const Message<Ref<DateInterval>(std::int32_t)> accessibilityDateIntervalForIndex{
    "accessibilityDateIntervalForIndex:"};

// A trend over time: the title as a header, then one element per bar that has a figure.
class TrendDetailChartViewAccessibility : public TrendChart<TrendDetailChartViewAccessibility> {
 public:
  static GraphSource graphSource() {
    return {"barStops"_key, "kAXTrendDetailGraphElements"_key, &Number::staticClass()};
  }
  static RangeKeys rangeKeys() {
    return {"kAXTrendDetailGraphCachedMin"_key, "kAXTrendDetailGraphCachedMax"_key};
  }

  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("accessibilityDateIntervalForIndex:", {"@", "i"});
    contract.instanceMethod("accessibilityQuantityForIndex:", {"@", "i"});
    contract.instanceMethod("layoutSubviews", {"v"});
    contract.instanceMethod("titleLabel", {"@"});
    contract.instanceMethod("chartMaxLabel", {"@"});
    contract.instanceMethod("accessibilityUnit", {"@"});
    contract.instanceMethod("barStops", {"@"});
  }

  Ref<String> _accessibilityDataSeriesName() { return nullptr; }

  Ref<String> _accessibilityDataSeriesTitleForAxis(std::int64_t axis) {
    if (axis == horizontalAxis) return accessibilityLocalizedString("trend.time.axis");
    if (axis != verticalAxis) return nullptr;
    const Ref<Label> top = castAsClass<Label>(safeUIViewForKey(self, "chartMaxLabel"_key));
    return top ? messages::text(top) : trendUnitString(self);
  }

  Ref<String> _accessibilityDataSeriesUnitLabelForAxis(std::int64_t axis) {
    if (axis == horizontalAxis) return accessibilityLocalizedString("trend.time.unit");
    return axis == verticalAxis ? trendUnitString(self) : nullptr;
  }

  // As many as there are elements, the title among them.
  Ref<Number> lastColumn() {
    const Ref<Array> elements = messages::accessibilityElements(self);
    return number(std::uint64_t(elements ? elements->count() : 0));
  }

  Ref<Array> _accessibilityDataSeriesValuesForAxis(std::int64_t axis) {
    Array::Items values;
    const std::size_t bars = isAxis(axis) ? barCount() : 0;
    values.reserve(bars);
    const Ref<Unit> unit = axis == verticalAxis ? trendUnit(self) : nullptr;
    for (std::size_t i = 0; i < bars; ++i) {
      values.push_back(axis == horizontalAxis ? number(static_cast<std::int32_t>(i))
                                              : roundedFigure(i, unit));
    }
    return array(std::move(values));
  }

  Ref<String> _accessibilityDataSeriesValueDescriptionForPositionAxis(double position, std::int64_t axis) {
    if (axis == verticalAxis) return spokenFigureInRange(self, rangeKeys(), position, trendUnit(self));
    return axis == horizontalAxis ? spokenDay(position) : nullptr;
  }

  void addColumns(MutableArray& elements, double titleHeight) {
    const Ref<DateIntervalFormatter> formatter = make<DateIntervalFormatter>();
    formatter->setDateTemplate("MMMMdyyyy");
    const Ref<View> view = castAsClass<View>(self);
    const Ref<Array> stops = messages::_accessibilityGraphData(self);
    if (!view || !stops || stops->isEmpty()) return;
    elements.reserve(elements.count() + stops->count());
    const double top = 2 * titleHeight;
    const Rect area = messages::frame(view);
    const double width = area.width / static_cast<double>(stops->count());
    const double height = std::floor(area.height) - top;
    Extremes extremes;
    for (std::size_t i = 0; i < stops->count(); ++i) {
      const Rect frame = {width + static_cast<float>(unboxDouble(stops->at(i))), top, width, height};
      elements.axSafelyAddObject(barElement(i, frame, *formatter, extremes));
    }
    keep(rangeKeys().minimum, extremes.minimum);
    keep(rangeKeys().maximum, extremes.maximum);
  }

 private:
  std::size_t barCount() {
    const Ref<Array> stops = messages::_accessibilityGraphData(self);
    return stops ? stops->count() : 0;
  }

  Ref<Number> roundedFigure(std::size_t bar, const Ref<Unit>& unit) {
    const Ref<Quantity> quantity = answerForColumn(accessibilityQuantityForIndex, self, bar);
    return number(roundedToHundredths(figureInUnit(quantity, unit)));
  }

  // The first day for the very start of the axis, else the last day of the nearest bar.
  Ref<String> spokenDay(double position) {
    const std::int32_t bar = nearestColumn((static_cast<double>(barCount()) - 1) * position);
    const Ref<DateInterval> days = answerForColumn(accessibilityDateIntervalForIndex, self, bar);
    const Ref<DateFormatter> formatter = make<DateFormatter>();
    formatter->setDateStyle(DateFormatterStyle::medium);
    if (!days) return nullptr;
    return formatter->stringFromDate(position == 0 ? days->startDate() : days->endDate());
  }

  Ref<AccessibilityElement> barElement(std::size_t bar, Rect frame, const DateIntervalFormatter& formatter,
                                       Extremes& extremes) {
    const Ref<Quantity> quantity = answerForColumn(accessibilityQuantityForIndex, self, bar);
    const Ref<DateInterval> days = answerForColumn(accessibilityDateIntervalForIndex, self, bar);
    const Ref<Unit> unit = trendUnit(self);
    if (!quantity || !days || !unit || !messages::isCompatibleWithUnit(quantity, unit)) return nullptr;
    const double figure = messages::doubleValueForUnit(quantity, unit);
    extremes.include(figure);
    return chartElement(self, frame, formatter.stringFromDateInterval(*days), spokenFigure(figure, unit));
  }

  void keep(Key key, double figure) {
    self._accessibilitySetRetainedValueForKey(number(roundedToHundredths(figure)), key);
  }
};

}  // namespace

AX_CATEGORY(TrendDetailChartViewAccessibility, "Velto.TrendDetailChartView",
            overrides<&C::_accessibilityGraphData>(messages::_accessibilityGraphData))

}  // namespace ax
