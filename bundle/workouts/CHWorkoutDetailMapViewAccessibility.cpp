#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

// The route map: one button named by its title.
class CHWorkoutDetailMapViewAccessibility : public SafeCategory<CHWorkoutDetailMapViewAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    manager.validateClassIsKindOfClass("CHWorkoutDetailMapView", "View");
    manager.validateClassHasInstanceVariableWithType("CHWorkoutDetailMapView", "_titleLabel", "Label");
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() { return _accessibilityStringForLabelKeyValues(self, "_titleLabel"); }
  Ref<String> accessibilityHint() { return accessibilityLocalizedString("workout.detail.map.hint"); }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitButton; }

  Rect accessibilityFrame() {
    const Ref<View> view = castAsClass<View>(self);
    return view ? frameForElements(messages::subviews(view)) : super(messages::accessibilityFrame);
  }
};

using C = CHWorkoutDetailMapViewAccessibility;

const CategoryRegistration<C> registration{
    "CHWorkoutDetailMapViewAccessibility",
    "CHWorkoutDetailMapView",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel),
     overrides<&C::accessibilityHint>(messages::accessibilityHint),
     overrides<&C::accessibilityTraits>(messages::accessibilityTraits),
     overrides<&C::accessibilityFrame>(messages::accessibilityFrame)}};

}  // namespace

}  // namespace ax
