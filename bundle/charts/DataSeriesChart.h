#pragma once

#include "bundle/charts/GraphData.h"
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
  std::int64_t _accessibilityDataSeriesType() { return 2; }

  Ref<Array> _accessibilityGraphData() {
    return cast<Array>(self._accessibilityValueForKey(C::graphSource().graphKey));
  }
  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    refreshGraphData(self, C::graphSource());
  }
};

}  // namespace ax
