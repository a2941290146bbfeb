#include "bundle/core/Category.h"

namespace ax {

namespace {

// A day of the palette: selected while its circle is full.
class WeekPaletteTappableDayAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.isKindOf("ActivityTappableDay");
    contract.instanceVariable("_circle", "Layer");
  }

  Traits accessibilityTraits() {
    const Traits traits = super(messages::accessibilityTraits);
    const bool isSelected = safeDoubleForKey(self.safeValueForKey("_circle"_key), "alpha"_key) == 1;
    return isSelected ? traits | TraitSelected : traits;
  }
  // The frame alone outlines the day.
  Ref<Object> accessibilityPath() { return nullptr; }
};

}  // namespace

AX_CATEGORY(WeekPaletteTappableDayAccessibility, "WeekPaletteTappableDay")

}  // namespace ax
