#include "bundle/core/Category.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

// The totals over the workout list, those that are shown.
class CHWorkoutsListSummaryTableViewCellAccessibility
    : public SafeCategory<CHWorkoutsListSummaryTableViewCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "CHWorkoutsListSummaryTableViewCell";
    constexpr auto container = "_CHWorkoutSummaryTabbedLabelContainer";
    manager.validateClassIsKindOfClass(container, "View");
    manager.validateClassHasInstanceVariableWithType(target, "_numberOfWorkoutsLabel", container);
    manager.validateClassHasInstanceVariableWithType(target, "_activeEnergyLabel", container);
    manager.validateClassHasInstanceVariableWithType(target, "_durationLabel", container);
    manager.validateClassHasInstanceVariableWithType(target, "_distanceLabel", container);
    manager.validateClassHasInstanceVariableWithType(target, "_paceLabel", container);
  }

  Ref<Array> accessibilityElements() {
    const Ref<Array> totals = axArrayByIgnoringNilElementsWithCount(
        5, {safeUIViewForKey(self, "_numberOfWorkoutsLabel"_key),
            safeUIViewForKey(self, "_durationLabel"_key), safeUIViewForKey(self, "_activeEnergyLabel"_key),
            safeUIViewForKey(self, "_distanceLabel"_key), safeUIViewForKey(self, "_paceLabel"_key)});
    return ax_filteredArrayUsingBlock(*totals,
                                      [](Object& total) { return _accessibilityViewIsVisible(total); });
  }
};

using C = CHWorkoutsListSummaryTableViewCellAccessibility;

const CategoryRegistration<C> registration{
    "CHWorkoutsListSummaryTableViewCellAccessibility",
    "CHWorkoutsListSummaryTableViewCell",
    {overrides<&C::accessibilityElements>(messages::accessibilityElements)}};

}  // namespace

}  // namespace ax
