#include "bundle/core/Category.h"
#include "bundle/shared/DayRings.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/foundation/Formatters.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

// A day is drawn smaller than the area that stands for it.
constexpr double besideDay = 10;
constexpr double belowDay = 70;

// A day of the month: its date, and what was done on it.
class MonthDayCellLayerAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.of("ActivitySummaryCache").classMethod("sharedInstance", {"@"});
    contract.instanceVariable("_hasWorkout", "B");
    contract.instanceMethod("isFutureDay", {"B"});
    contract.of("QSCalendarDayCell").instanceMethod("representsToday", {"B"});
    contract.of("QSCalendarDayCell").instanceMethod("date", {"@"});
    contract.isKindOf("QSCalendarDayCell");
    contract.of("MonthWeekView").exists();
    contract.of("MonthScrollViewController").exists();
    contract.of("MonthViewController").exists();
  }

  bool isAccessibilityElement() { return true; }

  Ref<String> accessibilityLabel() {
    const Ref<Object> container = messages::accessibilityContainer(self);
    const bool isInWeekRow = container && container->isKindOf(safeClassFromString("MonthWeekView"_key));
    const bool isToday = self.safeBoolForKey("representsToday"_key);
    return stringForVariables({isToday ? accessibilityLocalizedString("today") : nullptr,
                               dateStringForFormat(date(), isInWeekRow ? "dMMMM" : "EEEE"),
                               stringForVariablesSentinel});
  }

  Ref<String> accessibilityValue() {
    if (self.safeBoolForKey("isFutureDay"_key)) return accessibilityLocalizedString("no.data");
    const Ref<String> rings = accessibilityVeltoStringForDate(date(), true);
    const bool hasWorkout = self.safeBoolForKey("_hasWorkout"_key);
    const Ref<String> value =
        stringForVariables({hasWorkout ? accessibilityLocalizedString("worked.out") : nullptr, rings,
                            stringForVariablesSentinel});
    return isEmpty(value) ? accessibilityLocalizedString("no.data") : value;
  }

  Rect accessibilityFrame() {
    const Ref<Layer> layer = castAsClass<Layer>(self);
    if (!layer) return super(messages::accessibilityFrame);
    const Rect drawn = messages::frame(layer);
    const Rect area{drawn.x - besideDay, drawn.y, drawn.width + 2 * besideDay, drawn.height + belowDay};
    return convertFrameToScreenCoordinates(area, _accessibilityAncestorIsKindOf(self, &View::staticClass()));
  }

 private:
  Ref<Date> date() { return castAsClass<Date>(self.safeValueForKey("date"_key)); }
};

}  // namespace

AX_CATEGORY(MonthDayCellLayerAccessibility, "MonthDayCellLayer")

}  // namespace ax
