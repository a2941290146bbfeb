#include <cmath>

#include "bundle/charts/DataSeriesChart.h"
#include "bundle/charts/DaySpans.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/runtime/Value.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

constexpr std::size_t spanCount = 8;
constexpr TimeInterval spanLength = 10800;

constinit const Message<void()> accessibilityReloadData{"accessibilityReloadData"};

Ref<String> calories(float sum) {
  return stringWithFormat(accessibilityLocalizedString("calories.format"),
                          {formatFloat(FloatFormat::whole, sum)});
}
Ref<String> wholeMinutes(float sum) {
  return stringWithFormat(accessibilityLocalizedString("minutes.format"), {formatWhole(sum)});
}
Ref<String> nothing(float) {
  return nullptr;
}

// What the host shows in this view: one row per chart type, in the order of their numbers.
struct Kind {
  std::string_view series;
  std::string_view axis;
  std::string_view unit;
  Ref<String> (*value)(float sum);
};
constexpr Kind kinds[] = {
    {"activity.move.series", "activity.move.axis", "activity.energy.unit", calories},
    {"activity.move.time.series", "activity.move.minutes.axis", "activity.time.unit", wholeMinutes},
    {"activity.exercise.series", "activity.exercise.axis", "activity.time.unit", wholeMinutes}};
constexpr Kind unknownKind = {{}, {}, {}, nothing};

float sumOfSpan(const Array& points, std::size_t span) {
  const std::size_t perSpan = points.count() / spanCount;
  float sum = 0;
  for (std::size_t i = perSpan * span; i < perSpan * (span + 1); ++i) {
    sum += static_cast<float>(unboxPoint(points.at(i)).y);
  }
  return sum;
}

// The day's move energy, move minutes or exercise minutes: eight elements of three hours each.
class ActivityMoveAndExerciseChartViewAccessibility
    : public DayChart<ActivityMoveAndExerciseChartViewAccessibility> {
 public:
  static GraphSource graphSource() {
    return {"moveAndExerciseChartPoints"_key, "kAXDayViewCellGraphElements"_key, &Value::staticClass()};
  }

  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("moveAndExerciseChartPoints", {"@"});
    contract.instanceMethod("moveAndExerciseChartMaxYValue", {"@"});
    contract.instanceMethod("moveAndExerciseChartViewType", {"q"});
    contract.instanceMethod("accessibilityReloadData", {"v"});
  }

  bool isAccessibilityElement() { return false; }
  Ref<String> _accessibilityDataSeriesName() {
    const std::string_view series = kind().series;
    return series.empty() ? nullptr : accessibilityLocalizedString(series);
  }
  Ref<String> _accessibilityDataSeriesTitleForAxis(std::int64_t axis) {
    return localizedTextForAxis(axis, "activity.time.of.day.axis", kind().axis);
  }
  Ref<String> _accessibilityDataSeriesUnitLabelForAxis(std::int64_t axis) {
    return localizedTextForAxis(axis, "activity.time.of.day.unit", kind().unit);
  }
  Ref<Number> highest() { return number(self.safeDoubleForKey("moveAndExerciseChartMaxYValue"_key)); }

  Ref<Array> accessibilityElements() {
    return chartElements(self, [this](MutableArray& elements) { addSpans(elements); });
  }

  void accessibilityReloadData() { messages::_accessibilityLoadAccessibilityInformation(self); }

 private:
  const Kind& kind() {
    const std::int64_t type = self.safeIntForKey("moveAndExerciseChartViewType"_key);
    return type >= 0 && type < std::ssize(kinds) ? kinds[type] : unknownKind;
  }

  void addSpans(MutableArray& elements) {
    elements.reserve(spanCount);
    DaySpans spans(spanLength, "hxa");
    const Ref<View> view = castAsClass<View>(self);
    const Ref<Array> points = messages::_accessibilityGraphData(self);
    if (!view || !points) return;
    const Rect area = messages::frame(view);
    const double width = std::floor(area.width / spanCount);
    const double height = std::floor(area.height);
    for (std::size_t i = 0; i < spanCount; ++i) {
      const Ref<String> value = kind().value(sumOfSpan(*points, i));
      const Rect frame = {width * static_cast<double>(i), 0, width, height};
      elements.axSafelyAddObject(chartElement(self, frame, spans.text(i, i == spanCount - 1), value));
    }
  }
};

}  // namespace

AX_CATEGORY(ActivityMoveAndExerciseChartViewAccessibility, "Velto.ActivityMoveAndExerciseChartView",
            overrides<&C::_accessibilityGraphData>(messages::_accessibilityGraphData),
            overrides<&C::accessibilityReloadData>(accessibilityReloadData))

}  // namespace ax
