#include "bundle/core/Category.h"

namespace ax {

namespace {

// One goal of a friend: the title is the label, what has been done of it the value.
class CHFriendDetailGoalCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_titleLabel", "Label");
    contract.instanceVariable("_subtitleLabel", "Label");
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() { return labelOfPart(self, self.safeValueForKey("_titleLabel"_key)); }
  Ref<String> accessibilityValue() { return labelOfPart(self, self.safeValueForKey("_subtitleLabel"_key)); }
};

}  // namespace

AX_CATEGORY(CHFriendDetailGoalCellAccessibility, "CHFriendDetailGoalCell")

}  // namespace ax
