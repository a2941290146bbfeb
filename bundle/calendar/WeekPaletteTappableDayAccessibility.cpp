#include "bundle/core/Category.h"

namespace ax {

namespace {

// A day of the palette: selected while its circle is full.
class WeekPaletteTappableDayAccessibility : public SafeCategory<WeekPaletteTappableDayAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "WeekPaletteTappableDay";
    manager.validateClassIsKindOfClass(target, "ActivityTappableDay");
    manager.validateClassHasInstanceVariableWithType(target, "_circle", "Layer");
  }

  Traits accessibilityTraits() {
    const Traits traits = super(messages::accessibilityTraits);
    const bool isSelected = safeDoubleForKey(self.safeValueForKey("_circle"_key), "alpha"_key) == 1;
    return isSelected ? traits | TraitSelected : traits;
  }
  // The frame alone outlines the day.
  Ref<Object> accessibilityPath() { return nullptr; }
};

using C = WeekPaletteTappableDayAccessibility;

const CategoryRegistration<C> registration{"WeekPaletteTappableDayAccessibility",
                                           "WeekPaletteTappableDay",
                                           {overrides<&C::accessibilityTraits>(messages::accessibilityTraits),
                                            overrides<&C::accessibilityPath>(messages::accessibilityPath)}};

}  // namespace

}  // namespace ax
