#pragma once

#include <vector>

#include "bundle/charts/GraphData.h"
#include "platform/toolkit/DataSeriesMessages.h"

namespace ax {

// The base of a category that turns a host view into a chart of bars. C says where its points come from:
//
//   static GraphSource graphSource() { return {"barStops"_key, "kAX..."_key, &Number::staticClass()}; }
//
// and has to answer, besides, what DataSeriesRegistration lists and this base does not have.
template <class C>
class GraphDataChart : public SafeCategory<C> {
 public:
  using SafeCategory<C>::SafeCategory;

  std::int64_t accessibilityContainerType() { return messages::dataSeriesContainerType; }
  bool _accessibilityDataSeriesSupportsSonification() { return true; }
  std::int64_t _accessibilityDataSeriesType() { return 2; }

  Ref<Array> _accessibilityGraphData() {
    return cast<Array>(this->self._accessibilityValueForKey(C::graphSource().graphKey));
  }
  void _accessibilityLoadAccessibilityInformation() {
    this->super(messages::_accessibilityLoadAccessibilityInformation);
    refreshGraphData(this->self, C::graphSource());
  }
};

// Registers a chart's category with what every chart answers, from C or its base, and what only this one
// does. The graph data and their refresh count in when C has them.
template <class C>
struct DataSeriesRegistration {
  DataSeriesRegistration(std::string_view name, std::string_view targetClassName,
                         std::initializer_list<Override> own) {
    namespace m = messages;
    std::vector<Override> all = {
        overrides<&C::accessibilityContainerType>(m::accessibilityContainerType),
        overrides<&C::accessibilityElements>(m::accessibilityElements),
        overrides<&C::_accessibilityDataSeriesSupportsSummarization>(
            m::_accessibilityDataSeriesSupportsSummarization),
        overrides<&C::_accessibilityDataSeriesSupportsSonification>(
            m::_accessibilityDataSeriesSupportsSonification),
        overrides<&C::_accessibilityDataSeriesType>(m::_accessibilityDataSeriesType),
        overrides<&C::_accessibilityDataSeriesValuesForAxis>(m::_accessibilityDataSeriesValuesForAxis),
        overrides<&C::_accessibilityDataSeriesTitleForAxis>(m::_accessibilityDataSeriesTitleForAxis),
        overrides<&C::_accessibilityDataSeriesUnitLabelForAxis>(m::_accessibilityDataSeriesUnitLabelForAxis),
        overrides<&C::_accessibilityDataSeriesMinimumValueForAxis>(
            m::_accessibilityDataSeriesMinimumValueForAxis),
        overrides<&C::_accessibilityDataSeriesMaximumValueForAxis>(
            m::_accessibilityDataSeriesMaximumValueForAxis)};
    if constexpr (requires { &C::_accessibilityGraphData; }) {
      all.push_back(overrides<&C::_accessibilityGraphData>(m::_accessibilityGraphData));
      all.push_back(overrides<&C::_accessibilityLoadAccessibilityInformation>(
          m::_accessibilityLoadAccessibilityInformation));
    }
    all.insert(all.end(), own.begin(), own.end());
    registerCategory(name, targetClassName, &C::_accessibilityPerformValidations, all);
  }
};

}  // namespace ax
