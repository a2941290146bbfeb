#include "bundle/core/Category.h"
#include "bundle/shared/DayRings.h"
#include "bundle/shared/LocalizedString.h"

namespace ax {

namespace {

// A day in the list of days: its date, and its rings as its value.
class ActivityThreeRingCellAccessibility : public SafeCategory<ActivityThreeRingCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "ActivityThreeRingCell";
    manager.validateClassHasInstanceVariableWithType(target, "_dateLabel", "Label");
    manager.validateClassHasInstanceVariableWithType(target, "_date", "Date");
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() { return labelOfPart(self, self.safeValueForKey("_dateLabel"_key)); }
  Ref<String> accessibilityValue() {
    const Ref<Date> date = castAsClass<Date>(self.safeValueForKey("_date"_key));
    const Ref<String> rings = accessibilityVeltoStringForDate(date, false);
    return isEmpty(rings) ? accessibilityLocalizedString("no.data") : rings;
  }
};

using C = ActivityThreeRingCellAccessibility;

const CategoryRegistration<C> registration{
    "ActivityThreeRingCellAccessibility",
    "ActivityThreeRingCell",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel),
     overrides<&C::accessibilityValue>(messages::accessibilityValue)}};

}  // namespace

}  // namespace ax
