#include "bundle/core/Category.h"

namespace ax {

namespace {

// The cell with a workout's map and weather, in that order.
class CHWorkoutDetailMapAndWeatherTableViewCellAccessibility
    : public SafeCategory<CHWorkoutDetailMapAndWeatherTableViewCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "CHWorkoutDetailMapAndWeatherTableViewCell";
    manager.validateClassHasInstanceVariableWithType(target, "_mapView", "_CHWorkoutDetailMapView");
    manager.validateClassHasInstanceVariableWithType(target, "_weatherView", "_CHWorkoutDetailWeatherView");
  }

  Ref<Array> accessibilityElements() {
    return axArrayByIgnoringNilElementsWithCount(
        2, {self.safeValueForKey("_mapView"_key), self.safeValueForKey("_weatherView"_key)});
  }
};

using C = CHWorkoutDetailMapAndWeatherTableViewCellAccessibility;

const CategoryRegistration<C> registration{
    "CHWorkoutDetailMapAndWeatherTableViewCellAccessibility",
    "CHWorkoutDetailMapAndWeatherTableViewCell",
    {overrides<&C::accessibilityElements>(messages::accessibilityElements)}};

}  // namespace

}  // namespace ax
