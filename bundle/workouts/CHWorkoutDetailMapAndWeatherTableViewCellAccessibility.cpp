#include "bundle/core/Category.h"

namespace ax {

namespace {

// The cell with a workout's map and weather, in that order.
class CHWorkoutDetailMapAndWeatherTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_mapView", "_CHWorkoutDetailMapView");
    contract.instanceVariable("_weatherView", "_CHWorkoutDetailWeatherView");
  }

  Ref<Array> accessibilityElements() {
    return axArrayByIgnoringNilElementsWithCount(
        2, {self.safeValueForKey("_mapView"_key), self.safeValueForKey("_weatherView"_key)});
  }
};

}  // namespace

AX_CATEGORY(CHWorkoutDetailMapAndWeatherTableViewCellAccessibility,
            "CHWorkoutDetailMapAndWeatherTableViewCell")

}  // namespace ax
