#include "bundle/core/Category.h"

namespace ax {

namespace {

// The header over a group of workouts: its date, then its detail.
class CHWorkoutListTableHeaderViewAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_dateLabel", "Label");
    contract.instanceVariable("_detailLabel", "Label");
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return stringForVariables({labelOfPart(self, self.safeValueForKey("_dateLabel"_key)),
                               labelOfPart(self, self.safeValueForKey("_detailLabel"_key)),
                               stringForVariablesSentinel});
  }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitHeader; }
};

}  // namespace

AX_CATEGORY(CHWorkoutListTableHeaderViewAccessibility, "CHWorkoutListTableHeaderView")

}  // namespace ax
