#include <cmath>

#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/foundation/Formatters.h"
#include "platform/health/Quantity.h"

namespace ax {

namespace {

constinit const Message<void(Ref<Object>, Ref<Object>, double)> setBriskMinutes{
    "setBriskMinutes:goal:percent:"};

// The exercise ring's chart: the figure is spoken as minutes out of the goal.
class ExerciseChartDetailCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.isKindOf("ChartDetailCell");
    contract.instanceMethod("setBriskMinutes: goal: percent:", {"v", "@", "@", "d"});
    contract.of("ChartDetailCell").instanceVariable("_value", "Label");
  }

  void setBriskMinutesGoalPercent(Ref<Object> briskMinutes, Ref<Object> goal, double percent) {
    super(setBriskMinutes, briskMinutes, goal, percent);
    messages::setAccessibilityLabel(self.safeValueForKey("_value"_key),
                                    stringWithFormat(accessibilityLocalizedString("minutes.format.out.of"),
                                                     {wholeMinutes(briskMinutes), wholeMinutes(goal)}));
  }

 private:
  static Ref<String> wholeMinutes(const Ref<Object>& time) {
    const Ref<Quantity> quantity = castAsClass<Quantity>(time);
    const double minutes = messages::doubleValueForUnit(quantity, Unit::minuteUnit());
    return formatWhole(std::round(minutes));
  }
};

}  // namespace

AX_CATEGORY(ExerciseChartDetailCellAccessibility, "ExerciseChartDetailCell",
            overrides<&C::setBriskMinutesGoalPercent>(setBriskMinutes))

}  // namespace ax
