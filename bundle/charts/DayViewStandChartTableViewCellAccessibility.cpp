#include "bundle/charts/TitleAndValuePair.h"
#include "bundle/core/Category.h"

namespace ax {

namespace {

// The day's row with the stand chart: its title and value, the chart, the idle hours.
class DayViewStandChartTableViewCellAccessibility
    : public SafeCategory<DayViewStandChartTableViewCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "Velto.DayViewStandChartTableViewCell";
    manager.validateClassHasInstanceMethodWithFullSignature(target, "chartView", {"@"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "idleHoursLabel", {"@"});
    manager.validateClass(titleAndValuePairClassName);
  }

  Ref<Array> accessibilityElements() {
    return axArrayByIgnoringNilElementsWithCount(
        3, {preparedAsHeader(firstPair()), self.safeValueForKey("chartView"_key),
            self.safeValueForKey("idleHoursLabel"_key)});
  }

 private:
  // The cell names its pair nowhere.
  Ref<Object> firstPair() {
    const Class* pairClass = safeClassFromString(titleAndValuePairClassName);
    return _accessibilityFindSubviewDescendantsPassingTest(
               self, [pairClass](Object& view) { return view.isKindOf(pairClass); })
        ->firstObject();
  }
};

using C = DayViewStandChartTableViewCellAccessibility;

const CategoryRegistration<C> registration{
    "DayViewStandChartTableViewCellAccessibility",
    "Velto.DayViewStandChartTableViewCell",
    {overrides<&C::accessibilityElements>(messages::accessibilityElements)}};

}  // namespace

}  // namespace ax
