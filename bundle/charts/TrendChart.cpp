#include "bundle/charts/TrendChart.h"

#include <cmath>

#include "bundle/shared/LocalizedString.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/Boxing.h"

namespace ax {

double roundedToHundredths(double value) {
  return std::floor(value * 100 + 0.5) / 100;
}

std::int32_t nearestColumn(double position) {
  return number(std::round(static_cast<float>(position)))->intValue();
}

Ref<Unit> trendUnit(Object& chart) {
  return castAsClass<Unit>(chart.safeValueForKey("accessibilityUnit"_key));
}

Ref<String> trendUnitString(Object& chart) {
  return messages::unitString(trendUnit(chart));
}

double figureInUnit(const Ref<Quantity>& quantity, const Ref<Unit>& unit) {
  return messages::doubleValueForUnit(quantity, unit);
}

Ref<String> spokenFigure(double value, const Ref<Unit>& unit) {
  return stringWithFormat(accessibilityLocalizedString("trends.value.with.unit"),
                          {formatFloat(FloatFormat::twoDecimals, static_cast<float>(value)), unit});
}

double keptFigure(Object& chart, Key key) {
  return unboxDouble(chart._accessibilityValueForKey(key));
}

Ref<String> spokenFigureInRange(Object& chart, const RangeKeys& keys, double position,
                                const Ref<Unit>& unit) {
  const double minimum = keptFigure(chart, keys.minimum);
  const double maximum = keptFigure(chart, keys.maximum);
  return spokenFigure(minimum + (maximum - minimum) * position, unit);
}

}  // namespace ax
