#include "bundle/charts/TitleAndValuePair.h"
#include "bundle/core/Category.h"

namespace ax {

namespace {

// The day's row with the stand chart: its title and value, the chart, the idle hours.
class DayViewStandChartTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("chartView", {"@"});
    contract.instanceMethod("idleHoursLabel", {"@"});
    contract.of(titleAndValuePairClassName).exists();
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

}  // namespace

AX_CATEGORY(DayViewStandChartTableViewCellAccessibility, "Velto.DayViewStandChartTableViewCell")

}  // namespace ax
