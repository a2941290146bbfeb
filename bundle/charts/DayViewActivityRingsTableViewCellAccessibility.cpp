#include "bundle/core/Category.h"

namespace ax {

namespace {

// The day's row with the rings: nothing but the rings.
class DayViewActivityRingsTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.of("ARUIRingsView").exists();
  }

  Ref<Array> accessibilityElements() {
    const Class* ringsClass = safeClassFromString("ARUIRingsView"_key);
    return _accessibilityFindSubviewDescendantsPassingTest(
        self, [ringsClass](Object& view) { return view.isKindOf(ringsClass); });
  }
};

}  // namespace

AX_CATEGORY(DayViewActivityRingsTableViewCellAccessibility, "Velto.DayViewActivityRingsTableViewCell")

}  // namespace ax
