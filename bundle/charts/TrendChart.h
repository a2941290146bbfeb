#pragma once

#include <algorithm>

#include "bundle/charts/DataSeriesChart.h"
#include "platform/health/Quantity.h"
#include "platform/toolkit/View.h"

// What the two charts of a trend's detail screen have in common: figures asked of the host column by column,
// the unit that they are spoken in, and a range that is kept on the chart. Main thread only.
namespace ax {

// Two decimals; halfway between two hundredths goes up.
double roundedToHundredths(double value);

// The column nearest to a position counted in columns, taken in single precision; halves go away from zero.
// What no index can hold becomes the last one that it can, and what is no number 0.
std::int32_t nearestColumn(double position);

// What the host answers for a column; nil when it raises, as it does for a column that it does not have.
template <class T>
Ref<T> answerForColumn(const Message<Ref<T>(std::int32_t)>& message, Object& chart, std::size_t column) {
  Ref<T> answer;
  performSafeBlock([&] { answer = message(chart, static_cast<std::int32_t>(column)); });
  return answer;
}

// The unit of the chart's figures; nil when the host gives none.
Ref<Unit> trendUnit(Object& chart);
Ref<String> trendUnitString(Object& chart);

// 0 for no quantity, without a unit, and for a quantity that the unit does not measure.
double figureInUnit(const Ref<Quantity>& quantity, const Ref<Unit>& unit);

// "8.25 kilometers".
Ref<String> spokenFigure(double value, const Ref<Unit>& unit);

// The smallest and the largest figure that a chart has spoken, kept on the chart under these names.
struct RangeKeys {
  Key minimum;
  Key maximum;
};

// An end that is not kept counts as 0.
double keptFigure(Object& chart, Key key);

// The figure that lies at a position from 0 to 1 of the kept range, in words.
Ref<String> spokenFigureInRange(Object& chart, const RangeKeys& keys, double position, const Ref<Unit>& unit);

// The base of both categories. C says, besides what GraphDataChart asks, under which keys it keeps its range:
// `static RangeKeys rangeKeys()`; where its horizontal axis ends: `Ref<Number> lastColumn()`; and adds an
// element for each column: `void addColumns(MutableArray& elements, double titleHeight)`.
template <class C>
class TrendChart : public GraphDataChart<C> {
 public:
  using GraphDataChart<C>::GraphDataChart;

  bool _accessibilityDataSeriesSupportsSummarization() { return true; }

  // From 0, or from the smallest figure when that is negative.
  Ref<Number> _accessibilityDataSeriesMinimumValueForAxis(std::int64_t axis) {
    if (axis == horizontalAxis) return number(0);
    if (axis != verticalAxis) return nullptr;
    return number(std::min(0.0, keptFigure(this->self, C::rangeKeys().minimum)));
  }

  Ref<Number> _accessibilityDataSeriesMaximumValueForAxis(std::int64_t axis) {
    if (axis == horizontalAxis) return static_cast<C*>(this)->lastColumn();
    if (axis != verticalAxis) return nullptr;
    return cast<Number>(this->self._accessibilityValueForKey(C::rangeKeys().maximum));
  }

  // The title as a header, then the columns. A chart that answers itself is no part of the list that it
  // keeps.
  Ref<Array> accessibilityElements() {
    return chartElements(this->self, [this](MutableArray& elements) {
      Ref<View> title = safeUIViewForKey(this->self, "titleLabel"_key);
      if (title.get() == &this->self) title = nullptr;
      _accessibilityAddTrait(title, TraitHeader);
      elements.axSafelyAddObject(title);
      static_cast<C*>(this)->addColumns(elements, messages::frame(title).height);
    });
  }

  void layoutSubviews() {
    this->super(messages::layoutSubviews);
    messages::_accessibilityLoadAccessibilityInformation(this->self);
  }
};

}  // namespace ax
