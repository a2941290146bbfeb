#include "bundle/charts/TitleAndValuePair.h"
#include "bundle/core/Category.h"

namespace ax {

namespace {

// The day's row with the move or exercise chart: its title and value, the chart, the text below.
class DayViewMoveAndExerciseChartTableViewCellAccessibility
    : public SafeCategory<DayViewMoveAndExerciseChartTableViewCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "Velto.DayViewMoveAndExerciseChartTableViewCell";
    manager.validateClassHasInstanceMethodWithFullSignature(target, "chartView", {"@"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "auxiliaryLabel", {"@"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "labelPair", {"@"});
    manager.validateClass(titleAndValuePairClassName);
  }

  Ref<Array> accessibilityElements() {
    return axArrayByIgnoringNilElementsWithCount(
        3, {preparedAsHeader(self.safeValueForKey("labelPair"_key)), self.safeValueForKey("chartView"_key),
            self.safeValueForKey("auxiliaryLabel"_key)});
  }
};

using C = DayViewMoveAndExerciseChartTableViewCellAccessibility;

const CategoryRegistration<C> registration{
    "DayViewMoveAndExerciseChartTableViewCellAccessibility",
    "Velto.DayViewMoveAndExerciseChartTableViewCell",
    {overrides<&C::accessibilityElements>(messages::accessibilityElements)}};

}  // namespace

}  // namespace ax
