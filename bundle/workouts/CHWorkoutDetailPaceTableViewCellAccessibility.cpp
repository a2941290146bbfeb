#include "bundle/core/Category.h"
#include "bundle/shared/Pace.h"
#include "platform/health/Workout.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

const Message<void(Ref<Object>, Ref<Object>)> configureWithWorkoutDataCalculator{
    "configureWithWorkout:dataCalculator:"};

// The pace of a workout, spoken as minutes and seconds. A ride shows a speed and keeps what the cell said.
class CHWorkoutDetailPaceTableViewCellAccessibility
    : public SafeCategory<CHWorkoutDetailPaceTableViewCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "CHWorkoutDetailPaceTableViewCell";
    manager.validateClassHasInstanceVariableWithType(target, "_titleLabel", "Label");
    manager.validateClassHasInstanceVariableWithType(target, "_valueLabel", "Label");
    manager.validateClassHasInstanceMethodWithFullSignature(
        target, "configureWithWorkout:dataCalculator:", {"v", "@", "@"});
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

using C = CHWorkoutDetailPaceTableViewCellAccessibility;

const CategoryRegistration<C> registration{
    "CHWorkoutDetailPaceTableViewCellAccessibility",
    "CHWorkoutDetailPaceTableViewCell",
    {overrides<&C::_accessibilityLoadAccessibilityInformation>(
         messages::_accessibilityLoadAccessibilityInformation),
     overrides<&C::configureWithWorkoutDataCalculator>(ax::configureWithWorkoutDataCalculator)}};

}  // namespace

}  // namespace ax
