#include "bundle/core/Category.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

// A section's header, which opens and closes the section: activating it presses its button.
class CHWorkoutDetailExpandingHeaderViewAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_titleLabel", "Label");
    contract.instanceVariable("_expandButton", "Button");
    contract.instanceVariable("_expanded", "B");
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

}  // namespace

AX_CATEGORY(CHWorkoutDetailExpandingHeaderViewAccessibility, "CHWorkoutDetailExpandingHeaderView")

}  // namespace ax
