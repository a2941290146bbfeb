#include "bundle/core/Category.h"

namespace ax {

namespace {

// The title over a group of badges, as a header.
class CHAchievementsSectionHeaderViewAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("label", {"@"});
  }

  bool isAccessibilityElement() { return true; }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitHeader; }
  Ref<String> accessibilityLabel() { return _accessibilityStringForLabelKeyValues(self, "label"); }
};

}  // namespace

AX_CATEGORY(CHAchievementsSectionHeaderViewAccessibility, "CHAchievementsSectionHeaderView")

}  // namespace ax
