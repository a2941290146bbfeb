#include "bundle/core/Category.h"

namespace ax {

namespace {

// The row of one competition: the score, then the days that remain.
class CHFriendListCompetitionTableViewCellAccessibility
    : public SafeCategory<CHFriendListCompetitionTableViewCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "CHFriendListCompetitionTableViewCell";
    manager.validateClassHasInstanceVariableWithType(target, "_daysRemainingLabel", "Label");
    manager.validateClassHasInstanceVariableWithType(target, "_scoreView", "ASCompetitionScoreView");
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return _accessibilityStringForLabelKeyValues(self, "_scoreView, _daysRemainingLabel");
  }
};

using C = CHFriendListCompetitionTableViewCellAccessibility;

const CategoryRegistration<C> registration{
    "CHFriendListCompetitionTableViewCellAccessibility",
    "CHFriendListCompetitionTableViewCell",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel)}};

}  // namespace

}  // namespace ax
