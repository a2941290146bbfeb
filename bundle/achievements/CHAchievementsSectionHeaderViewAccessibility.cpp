#include "bundle/core/Category.h"

namespace ax {

namespace {

// The title over a group of badges, as a header.
class CHAchievementsSectionHeaderViewAccessibility
    : public SafeCategory<CHAchievementsSectionHeaderViewAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    manager.validateClassHasInstanceMethodWithFullSignature("CHAchievementsSectionHeaderView", "label",
                                                            {"@"});
  }

  bool isAccessibilityElement() { return true; }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitHeader; }
  Ref<String> accessibilityLabel() { return _accessibilityStringForLabelKeyValues(self, "label"); }
};

using C = CHAchievementsSectionHeaderViewAccessibility;

const CategoryRegistration<C> registration{
    "CHAchievementsSectionHeaderViewAccessibility",
    "CHAchievementsSectionHeaderView",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityTraits>(messages::accessibilityTraits),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel)}};

}  // namespace

}  // namespace ax
