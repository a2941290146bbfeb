#include <cmath>

#include "bundle/charts/DataSeriesChart.h"
#include "bundle/charts/DaySpans.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/runtime/Value.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

constexpr TimeInterval hour = 3600;

// The day's stand hours: one element per hour that the host shows, active or idle.
class ActivityStandChartViewAccessibility : public DayChart<ActivityStandChartViewAccessibility> {
 public:
  static GraphSource graphSource() {
    return {"standChartPoints"_key, "kAXDayViewCellGraphElements"_key, &Value::staticClass()};
  }

  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("standChartPoints", {"@"});
  }

  Ref<String> _accessibilityDataSeriesName() {
    return accessibilityLocalizedString("stand.hours.data.series");
  }
  Ref<String> _accessibilityDataSeriesTitleForAxis(std::int64_t axis) {
    return localizedTextForAxis(axis, "activity.time.of.day.axis", "stand.goal.data.unit");
  }
  Ref<String> _accessibilityDataSeriesUnitLabelForAxis(std::int64_t axis) {
    return axis == verticalAxis ? emptyString() : localizedTextForAxis(axis, "activity.time.of.day.unit", {});
  }
  Ref<Number> highest() { return number(1); }

  Ref<Array> accessibilityElements() {
    return chartElements(self, [this](MutableArray& elements) { addHours(elements); });
  }

 private:
  static Ref<String> valueOf(const Ref<Object>& point) {
    const bool isActive = static_cast<float>(unboxPoint(point).y) > 0;
    return accessibilityLocalizedString(isActive ? "stand.goal.active" : "stand.goal.inactive");
  }

  void addHours(MutableArray& elements) {
    const Ref<Array> points = messages::_accessibilityGraphData(self);
    const std::size_t count = points ? points->count() : 0;
    elements.reserve(count);
    DaySpans hours(hour, "ha");
    const Ref<View> view = castAsClass<View>(self);
    if (!view || count == 0) return;
    const Rect area = messages::frame(view);
    const double height = std::floor(area.height);
    const double width = std::ceil(area.width / static_cast<double>(count));
    for (std::size_t i = 0; i < count; ++i) {
      const Ref<String> value = valueOf(points->at(i));
      const Rect frame = {width * static_cast<double>(i), 0, width, height};
      elements.axSafelyAddObject(chartElement(self, frame, hours.text(i, i == count - 1), value));
    }
  }
};

}  // namespace

AX_CATEGORY(ActivityStandChartViewAccessibility, "Velto.ActivityStandChartView",
            overrides<&C::_accessibilityGraphData>(messages::_accessibilityGraphData))

}  // namespace ax
