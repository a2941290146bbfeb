#include "bundle/core/Category.h"
#include "bundle/shared/Pace.h"
#include "platform/toolkit/Label.h"

namespace ax {

namespace {

// One split: its unit, its distance where that is shown, its pace.
class CHWorkoutDetailSplitTableViewCellAccessibility
    : public SafeCategory<CHWorkoutDetailSplitTableViewCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto paceCell = "CHWorkoutDetailPaceTableViewCell";
    manager.validateClassHasInstanceVariableWithType(paceCell, "_unitLabel", "Label");
    manager.validateClassHasInstanceVariableWithType(paceCell, "_distanceLabel", "Label");
    manager.validateClassHasInstanceVariableWithType(paceCell, "_paceLabel", "Label");
  }

  Ref<String> accessibilityLabel() {
    const Ref<Label> distance = castAsClass<Label>(safeUIViewForKey(self, "_distanceLabel"_key));
    return stringForVariables(
        {labelOfPart(self, safeUIViewForKey(self, "_unitLabel"_key)),
         _accessibilityViewIsVisible(distance) ? messages::text(distance) : emptyString(),
         accessibilityAttributedStringForPaceContainingString(
             labelOfPart(self, safeUIViewForKey(self, "_paceLabel"_key))),
         stringForVariablesSentinel});
  }
};

using C = CHWorkoutDetailSplitTableViewCellAccessibility;

const CategoryRegistration<C> registration{"CHWorkoutDetailSplitTableViewCellAccessibility",
                                           "CHWorkoutDetailSplitTableViewCell",
                                           {overrides<&C::accessibilityLabel>(messages::accessibilityLabel)}};

}  // namespace

}  // namespace ax
