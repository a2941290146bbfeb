#include "bundle/core/Category.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

enum ExpandedStatus : std::int64_t { isExpanded = 1, isCollapsed = 2 };

// A section's header, which opens and closes the section: activating it presses its button.
class CHWorkoutDetailExpandingHeaderViewAccessibility
    : public SafeCategory<CHWorkoutDetailExpandingHeaderViewAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "CHWorkoutDetailExpandingHeaderView";
    manager.validateClassHasInstanceVariableWithType(target, "_titleLabel", "Label");
    manager.validateClassHasInstanceVariableWithType(target, "_expandButton", "Button");
    manager.validateClassHasInstanceVariableWithType(target, "_expanded", "B");
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() { return _accessibilityStringForLabelKeyValues(self, "_titleLabel"); }
  Traits accessibilityTraits() { return TraitButton | TraitHeader; }
  Point accessibilityActivationPoint() {
    return answerOfPart(messages::accessibilityActivationPoint, self,
                        safeUIViewForKey(self, "_expandButton"_key));
  }
  std::int64_t _accessibilityExpandedStatus() {
    return self.safeBoolForKey("_expanded"_key) ? isExpanded : isCollapsed;
  }
};

using C = CHWorkoutDetailExpandingHeaderViewAccessibility;

const CategoryRegistration<C> registration{
    "CHWorkoutDetailExpandingHeaderViewAccessibility",
    "CHWorkoutDetailExpandingHeaderView",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel),
     overrides<&C::accessibilityTraits>(messages::accessibilityTraits),
     overrides<&C::accessibilityActivationPoint>(messages::accessibilityActivationPoint),
     overrides<&C::_accessibilityExpandedStatus>(messages::_accessibilityExpandedStatus)}};

}  // namespace

}  // namespace ax
