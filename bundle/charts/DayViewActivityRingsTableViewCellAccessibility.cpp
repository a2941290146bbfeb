#include "bundle/core/Category.h"

namespace ax {

namespace {

// The day's row with the rings: nothing but the rings.
class DayViewActivityRingsTableViewCellAccessibility
    : public SafeCategory<DayViewActivityRingsTableViewCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) { manager.validateClass("ARUIRingsView"); }

  Ref<Array> accessibilityElements() {
    const Class* ringsClass = safeClassFromString("ARUIRingsView"_key);
    return _accessibilityFindSubviewDescendantsPassingTest(
        self, [ringsClass](Object& view) { return view.isKindOf(ringsClass); });
  }
};

using C = DayViewActivityRingsTableViewCellAccessibility;

const CategoryRegistration<C> registration{
    "DayViewActivityRingsTableViewCellAccessibility",
    "Velto.DayViewActivityRingsTableViewCell",
    {overrides<&C::accessibilityElements>(messages::accessibilityElements)}};

}  // namespace

}  // namespace ax
