#include "bundle/core/Category.h"

namespace ax {

namespace {

// One goal of a friend: the title is the label, what has been done of it the value.
class CHFriendDetailGoalCellAccessibility : public SafeCategory<CHFriendDetailGoalCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "CHFriendDetailGoalCell";
    manager.validateClassHasInstanceVariableWithType(target, "_titleLabel", "Label");
    manager.validateClassHasInstanceVariableWithType(target, "_subtitleLabel", "Label");
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() { return labelOfPart(self, self.safeValueForKey("_titleLabel"_key)); }
  Ref<String> accessibilityValue() { return labelOfPart(self, self.safeValueForKey("_subtitleLabel"_key)); }
};

using C = CHFriendDetailGoalCellAccessibility;

const CategoryRegistration<C> registration{
    "CHFriendDetailGoalCellAccessibility",
    "CHFriendDetailGoalCell",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel),
     overrides<&C::accessibilityValue>(messages::accessibilityValue)}};

}  // namespace

}  // namespace ax
