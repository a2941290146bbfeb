#include "bundle/core/Category.h"
#include "bundle/shared/Pace.h"
#include "platform/health/Workout.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

constinit const Message<void(Ref<Object>, Ref<Object>)> configureWithWorkoutDataCalculator{
    "configureWithWorkout:dataCalculator:"};

// The pace of a workout, spoken as minutes and seconds. A ride shows a speed and keeps what the cell said.
class CHWorkoutDetailPaceTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_titleLabel", "Label");
    contract.instanceVariable("_valueLabel", "Label");
    contract.instanceMethod("configureWithWorkout:dataCalculator:", {"v", "@", "@"});
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    messages::setAccessibilityLabel(self,
                                    messages::accessibilityLabel(safeUIViewForKey(self, "_titleLabel"_key)));
    messages::setAccessibilityValue(
        self, accessibilityAttributedStringForPaceContainingString(
                  messages::accessibilityLabel(safeUIViewForKey(self, "_valueLabel"_key))));
  }

  void configureWithWorkoutDataCalculator(Ref<Object> workout, Ref<Object> dataCalculator) {
    super(ax::configureWithWorkoutDataCalculator, workout, dataCalculator);
    if (safeIntForKey(workout, "workoutActivityType"_key) == WorkoutActivityTypeCycling) return;
    messages::_accessibilityLoadAccessibilityInformation(self);
  }
};

}  // namespace

AX_CATEGORY(CHWorkoutDetailPaceTableViewCellAccessibility, "CHWorkoutDetailPaceTableViewCell",
            overrides<&C::configureWithWorkoutDataCalculator>(ax::configureWithWorkoutDataCalculator))

}  // namespace ax
