#include "bundle/core/Category.h"

namespace ax {

namespace {

// One thing to do with a friend: a button named by its title.
class CHFriendDetailActionCellAccessibility : public SafeCategory<CHFriendDetailActionCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    manager.validateClassHasInstanceVariableWithType("CHFriendDetailActionCell", "_actionTitleLabel",
                                                     "Label");
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return labelOfPart(self, self.safeValueForKey("_actionTitleLabel"_key));
  }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitButton; }
};

using C = CHFriendDetailActionCellAccessibility;

const CategoryRegistration<C> registration{
    "CHFriendDetailActionCellAccessibility",
    "CHFriendDetailActionCell",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel),
     overrides<&C::accessibilityTraits>(messages::accessibilityTraits)}};

}  // namespace

}  // namespace ax
