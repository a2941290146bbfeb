#include "bundle/core/Category.h"
#include "bundle/shared/Pace.h"
#include "platform/toolkit/Label.h"

namespace ax {

namespace {

// One split: its unit, its distance where that is shown, its pace.
class CHWorkoutDetailSplitTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    const Contract paceCell = contract.of("CHWorkoutDetailPaceTableViewCell");
    paceCell.instanceVariable("_unitLabel", "Label");
    paceCell.instanceVariable("_distanceLabel", "Label");
    paceCell.instanceVariable("_paceLabel", "Label");
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

}  // namespace

AX_CATEGORY(CHWorkoutDetailSplitTableViewCellAccessibility, "CHWorkoutDetailSplitTableViewCell")

}  // namespace ax
