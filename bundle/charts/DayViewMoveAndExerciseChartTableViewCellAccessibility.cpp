#include "bundle/charts/TitleAndValuePair.h"
#include "bundle/core/Category.h"

namespace ax {

namespace {

// The day's row with the move or exercise chart: its title and value, the chart, the text below.
class DayViewMoveAndExerciseChartTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("chartView", {"@"});
    contract.instanceMethod("auxiliaryLabel", {"@"});
    contract.instanceMethod("labelPair", {"@"});
    contract.of(titleAndValuePairClassName).exists();
  }

  Ref<Array> accessibilityElements() {
    return axArrayByIgnoringNilElementsWithCount(
        3, {preparedAsHeader(self.safeValueForKey("labelPair"_key)), self.safeValueForKey("chartView"_key),
            self.safeValueForKey("auxiliaryLabel"_key)});
  }
};

}  // namespace

AX_CATEGORY(DayViewMoveAndExerciseChartTableViewCellAccessibility,
            "Velto.DayViewMoveAndExerciseChartTableViewCell")

}  // namespace ax
