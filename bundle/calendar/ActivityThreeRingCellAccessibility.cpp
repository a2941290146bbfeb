#include "bundle/core/Category.h"
#include "bundle/shared/DayRings.h"
#include "bundle/shared/LocalizedString.h"

namespace ax {

namespace {

// A day in the list of days: its date, and its rings as its value.
class ActivityThreeRingCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_dateLabel", "Label");
    contract.instanceVariable("_date", "Date");
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() { return labelOfPart(self, self.safeValueForKey("_dateLabel"_key)); }
  Ref<String> accessibilityValue() {
    const Ref<Date> date = castAsClass<Date>(self.safeValueForKey("_date"_key));
    const Ref<String> rings = accessibilityVeltoStringForDate(date, false);
    return isEmpty(rings) ? accessibilityLocalizedString("no.data") : rings;
  }
};

}  // namespace

AX_CATEGORY(ActivityThreeRingCellAccessibility, "ActivityThreeRingCell")

}  // namespace ax
