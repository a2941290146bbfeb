#include "bundle/core/Category.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

// The totals over the workout list, those that are shown.
class CHWorkoutsListSummaryTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    constexpr auto container = "_CHWorkoutSummaryTabbedLabelContainer";
    contract.of(container).isKindOf("View");
    contract.instanceVariable("_numberOfWorkoutsLabel", container);
    contract.instanceVariable("_activeEnergyLabel", container);
    contract.instanceVariable("_durationLabel", container);
    contract.instanceVariable("_distanceLabel", container);
    contract.instanceVariable("_paceLabel", container);
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

}  // namespace

AX_CATEGORY(CHWorkoutsListSummaryTableViewCellAccessibility, "CHWorkoutsListSummaryTableViewCell")

}  // namespace ax
