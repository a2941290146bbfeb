#include "bundle/core/Category.h"

namespace ax {

namespace {

// One thing to do with a friend: a button named by its title.
class CHFriendDetailActionCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_actionTitleLabel", "Label");
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return labelOfPart(self, self.safeValueForKey("_actionTitleLabel"_key));
  }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitButton; }
};

}  // namespace

AX_CATEGORY(CHFriendDetailActionCellAccessibility, "CHFriendDetailActionCell")

}  // namespace ax
