#include "bundle/core/Category.h"
#include "platform/toolkit/Control.h"
#include "platform/toolkit/Label.h"

namespace ax {

namespace {

constinit const Message<void()> createAndConstraintNoDataOverlay{"_createAndConstraintNoDataOverlay"};

// Nil when none of the view's direct subviews is one, or there is no view.
template <class T>
Ref<T> firstSubview(const Ref<View>& view) {
  const Ref<Array> subviews = messages::subviews(view);
  if (!subviews) return nullptr;
  for (const Ref<Object>& subview : *subviews) {
    if (T* found = cast<T>(subview.get())) return Ref<T>(found);
  }
  return nullptr;
}

Ref<String> labelOfOverlay(const Ref<View>& overlay) {
  const Ref<Label> label = firstSubview<Label>(overlay);
  return label ? messages::accessibilityLabel(label) : stringForAllChildren(overlay);
}

// The row of a workout's heart rate: what covers it when there is no data is one button.
class CHWorkoutDetailHeartRateChartTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_noDataOverlayView", "View");
    contract.instanceMethod("_createAndConstraintNoDataOverlay", {"v"});
  }

  void _createAndConstraintNoDataOverlay() {
    super(createAndConstraintNoDataOverlay);
    messages::_accessibilityLoadAccessibilityInformation(self);
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    const Ref<View> overlay = safeUIViewForKey(self, "_noDataOverlayView"_key);
    if (!overlay) return;
    const Weak<View> weak = overlay;
    _setIsAccessibilityElementBlock(overlay, [weak] { return weak && !messages::isHidden(weak.lock()); });
    _setAccessibilityLabelBlock(overlay, [weak] { return labelOfOverlay(weak.lock()); });
    _setAccessibilityActivateBlock(
        overlay, [weak] { return messages::accessibilityActivate(firstSubview<Button>(weak.lock())); });
    messages::setAccessibilityTraits(overlay, TraitButton);
  }
};

}  // namespace

AX_CATEGORY(CHWorkoutDetailHeartRateChartTableViewCellAccessibility,
            "CHWorkoutDetailHeartRateChartTableViewCell",
            overrides<&C::_createAndConstraintNoDataOverlay>(createAndConstraintNoDataOverlay))

}  // namespace ax
