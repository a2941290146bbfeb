#include "bundle/core/Category.h"

namespace ax {

namespace {

// The header over a group of workouts: its date, then its detail.
class CHWorkoutListTableHeaderViewAccessibility
    : public SafeCategory<CHWorkoutListTableHeaderViewAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "CHWorkoutListTableHeaderView";
    manager.validateClassHasInstanceVariableWithType(target, "_dateLabel", "Label");
    manager.validateClassHasInstanceVariableWithType(target, "_detailLabel", "Label");
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return stringForVariables({labelOfPart(self, self.safeValueForKey("_dateLabel"_key)),
                               labelOfPart(self, self.safeValueForKey("_detailLabel"_key)),
                               stringForVariablesSentinel});
  }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitHeader; }
};

using C = CHWorkoutListTableHeaderViewAccessibility;

const CategoryRegistration<C> registration{
    "CHWorkoutListTableHeaderViewAccessibility",
    "CHWorkoutListTableHeaderView",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel),
     overrides<&C::accessibilityTraits>(messages::accessibilityTraits)}};

}  // namespace

}  // namespace ax
