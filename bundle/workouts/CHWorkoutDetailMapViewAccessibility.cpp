#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

// The route map: one button named by its title.
class CHWorkoutDetailMapViewAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.isKindOf("View");
    contract.instanceVariable("_titleLabel", "Label");
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

}  // namespace

AX_CATEGORY(CHWorkoutDetailMapViewAccessibility, "CHWorkoutDetailMapView")

}  // namespace ax
