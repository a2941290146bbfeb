#pragma once

#include "bundle/charts/GraphData.h"
#include "bundle/charts/Slices.h"
#include "platform/toolkit/DataSeriesMessages.h"

namespace ax {

// The base of a category that turns a host view into a chart of bars. C says where its points come from:
//
//   static GraphSource graphSource() { return {"barStops"_key, "kAX..."_key, &Number::staticClass()}; }
//
// and has to answer, besides, what a data series answers and this base does not have. Its rows are those of
// the messages that are its own, with _accessibilityGraphData among them.
template <class C>
class GraphDataChart : public SafeCategory {
 public:
  using SafeCategory::SafeCategory;

  std::int64_t accessibilityContainerType() { return messages::dataSeriesContainerType; }
  bool _accessibilityDataSeriesSupportsSonification() { return true; }
  std::int64_t _accessibilityDataSeriesType() { return barSeries; }

  Ref<Array> _accessibilityGraphData() {
    return cast<Array>(self._accessibilityValueForKey(C::graphSource().graphKey));
  }
  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    refreshGraphData(self, C::graphSource());
  }
};

// The base of a chart of one day, whose horizontal axis counts hours. C says how far the vertical one goes:
// `Ref<Number> highest()`.
template <class C>
class DayChart : public GraphDataChart<C> {
 public:
  using GraphDataChart<C>::GraphDataChart;

  bool _accessibilityDataSeriesSupportsSummarization() { return false; }
  Ref<Array> _accessibilityDataSeriesValuesForAxis(std::int64_t axis) {
    return pointValuesForAxis(messages::_accessibilityGraphData(this->self), axis);
  }
  Ref<Number> _accessibilityDataSeriesMinimumValueForAxis(std::int64_t axis) {
    return isAxis(axis) ? number(0) : nullptr;
  }
  Ref<Number> _accessibilityDataSeriesMaximumValueForAxis(std::int64_t axis) {
    if (axis == horizontalAxis) return number(hoursOfDay);
    return axis == verticalAxis ? static_cast<C*>(this)->highest() : nullptr;
  }
};

}  // namespace ax
