#include "bundle/charts/Slices.h"
#include "bundle/core/Category.h"
#include "platform/foundation/Calendar.h"
#include "platform/foundation/Formatters.h"
#include "platform/toolkit/DataSeriesMessages.h"

namespace ax {

namespace {

// The hour that a clock on the wall shows at a moment, counted from the start of the day that holds `day`.
double wallClockHours(const Date& day, const Date& moment) {
  const Ref<Calendar> calendar = Calendar::currentCalendar();
  const Ref<Date> dayStart = calendar->startOfDayForDate(day);
  const TimeInterval clocksMoved = calendar->daylightSavingTimeOffsetForDate(moment) -
                                   calendar->daylightSavingTimeOffsetForDate(*dayStart);
  return (clocksMoved + moment.timeIntervalSinceDate(*dayStart)) / 3600;
}

// The active hours of a day, told in eight slices.
class ActivityActiveHoursChartAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_dataPoints", "Array");
    contract.instanceVariable("_barSeries", "VLUIChartUniformBarSeries");
    contract.of("VLUIChartUniformBarSeries").instanceVariable("_minDate", "Date");
    contract.of("VLUIChartPointNumeric").instanceMethod("xValue", {"@"});
    contract.of("VLUIChartPointNumeric").instanceMethod("yValue", {"@"});
  }

  bool _accessibilityShouldUseSlices() { return true; }
  std::uint64_t _accessibilityNumberOfSlices() { return sliceCount; }
  std::uint64_t _accessibilityHoursPerSlice() {
    const std::uint64_t slices = messages::_accessibilityNumberOfSlices(self);
    return slices == 0 ? 0 : hoursOfDay / slices;
  }
  double _accessibilityTimeIntervalPerSlice() {
    return static_cast<double>(messages::_accessibilityHoursPerSlice(self)) * 3600;
  }

  Ref<String> _accessibilityQuantityForSliceAtIndex(std::uint64_t index) {
    const Ref<Array> points = safeArrayForKey(self, "_dataPoints"_key);
    const auto slice = static_cast<double>(index);
    const double start = static_cast<double>(messages::_accessibilityHoursPerSlice(self)) * slice;
    const double end = static_cast<double>(messages::_accessibilityHoursPerSlice(self)) * (slice + 1);
    const Ref<Date> day =
        castAsClass<Date>(safeValueForKey(self.safeValueForKey("_barSeries"_key), "_minDate"_key));
    const double sum = day && points ? sumOfHours(*points, *day, start, end) : 0;
    return timeStringForType(TimeStringType::hours, static_cast<float>(sum));
  }

 private:
  // The end is excluded.
  static double sumOfHours(const Array& points, const Date& day, double start, double end) {
    double sum = 0;
    for (const Ref<Object>& point : points) {
      const Ref<Date> moment = castAsClass<Date>(safeValueForKey(point, "xValue"_key));
      const Ref<Number> amount = castAsClass<Number>(safeValueForKey(point, "yValue"_key));
      if (!moment || !amount) continue;
      const double hours = wallClockHours(day, *moment);
      if (hours >= start && hours < end) sum += amount->doubleValue();
    }
    return sum;
  }
};

}  // namespace

AX_CATEGORY(ActivityActiveHoursChartAccessibility, "ActivityActiveHoursChart")

}  // namespace ax
