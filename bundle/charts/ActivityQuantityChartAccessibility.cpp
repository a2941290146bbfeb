#include <cmath>

#include "bundle/charts/Slices.h"
#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/foundation/Formatters.h"
#include "platform/health/Unit.h"
#include "platform/runtime/Boxing.h"
#include "platform/toolkit/DataSeriesMessages.h"

namespace ax {

namespace {

constexpr TimeInterval pointLength = 900;

// The day's energy or minutes, a quarter of an hour per point, told in eight slices.
class ActivityQuantityChartAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_dataPoints", "Array");
    contract.instanceVariable("_preferredUnit", "Unit");
  }

  bool _accessibilityShouldUseSlices() { return true; }
  std::uint64_t _accessibilityNumberOfSlices() { return sliceCount; }
  double _accessibilityTimeIntervalPerSlice() {
    return static_cast<double>(pointsPerSlice(dataPoints())) * pointLength;
  }

  Ref<String> _accessibilityQuantityForSliceAtIndex(std::uint64_t index) {
    const double quantity = std::round(sumOfSlice(index));
    const Ref<Object> unit = self.safeValueForKey("_preferredUnit"_key);
    if (unit && unit->isEqual(*Unit::minuteUnit())) {
      return durationStringForDuration(quantity * 60);
    }
    const std::string_view format = quantity == 0 ? "calories.format.zero" : "calories.format";
    return stringWithFormat(accessibilityLocalizedString(format), {formatWhole(quantity)});
  }

 private:
  Ref<Array> dataPoints() { return castAsClass<Array>(self.safeValueForKey("_dataPoints"_key)); }

  static std::uint64_t pointsPerSlice(const Ref<Array>& points) {
    return points ? points->count() / sliceCount : 0;
  }

  // Beyond the last slice there is nothing.
  double sumOfSlice(std::uint64_t index) {
    const Ref<Array> points = dataPoints();
    const std::uint64_t perSlice = pointsPerSlice(points);
    double sum = 0;
    if (index >= sliceCount) return sum;
    for (std::uint64_t i = perSlice * index; i < perSlice * (index + 1); ++i) {
      sum += unboxDouble(safeValueForKey(points->at(i), "yValue"_key));
    }
    return sum;
  }
};

}  // namespace

AX_CATEGORY(ActivityQuantityChartAccessibility, "ActivityQuantityChart")

}  // namespace ax
