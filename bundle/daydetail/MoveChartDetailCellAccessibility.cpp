#include <cmath>

#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/foundation/Formatters.h"
#include "platform/health/Quantity.h"

namespace ax {

namespace {

constinit const Message<void(Ref<Object>, Ref<Object>, double)> setActiveEnergy{
    "setActiveEnergy:goalEnergy:percent:"};

// The move ring's chart: the figure is spoken as an amount out of the goal.
class MoveChartDetailCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.isKindOf("ChartDetailCell");
    contract.instanceMethod("setActiveEnergy: goalEnergy: percent:", {"v", "@", "@", "d"});
    contract.of("ChartDetailCell").instanceVariable("_value", "Label");
  }

  void setActiveEnergyGoalEnergyPercent(Ref<Object> activeEnergy, Ref<Object> goalEnergy, double percent) {
    super(setActiveEnergy, activeEnergy, goalEnergy, percent);
    const Ref<Unit> unit = userActiveEnergyUnit();
    const Ref<Object> value = self.safeValueForKey("_value"_key);
    messages::setAccessibilityLabel(value, unit ? caloriesLine(activeEnergy, goalEnergy, unit) : nullptr);
  }

 private:
  static Ref<String> caloriesLine(const Ref<Object>& activeEnergy, const Ref<Object>& goalEnergy,
                                  const Ref<Unit>& unit) {
    const Ref<String> fraction =
        stringWithFormat(accessibilityLocalizedString("quantity.fraction.format.without.units"),
                         {wholeAmount(activeEnergy, unit), wholeAmount(goalEnergy, unit)});
    return stringWithFormat(
        accessibilityLocalizedString(activeEnergy ? "calories.format" : "calories.format.zero"), {fraction});
  }

  // Nil when the host cannot say: then no amount is spoken, and the figure speaks its own text.
  static Ref<Unit> userActiveEnergyUnit() {
    const Ref<Object> manager =
        safeValueForKey(safeClassFromString("VLUIUnitManager"_key), "sharedManager"_key);
    return castAsClass<Unit>(safeValueForKey(manager, "userActiveEnergyBurnedUnit"_key));
  }

  static Ref<String> wholeAmount(const Ref<Object>& energy, const Ref<Unit>& unit) {
    const Ref<Quantity> quantity = castAsClass<Quantity>(energy);
    const double amount = messages::doubleValueForUnit(quantity, unit);
    return formatFloat(FloatFormat::whole, static_cast<float>(std::floor(amount)));
  }
};

}  // namespace

AX_CATEGORY(MoveChartDetailCellAccessibility, "MoveChartDetailCell",
            overrides<&C::setActiveEnergyGoalEnergyPercent>(setActiveEnergy))

}  // namespace ax
