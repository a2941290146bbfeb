#include "bundle/core/Category.h"
#include "platform/foundation/Formatters.h"
#include "platform/health/Workout.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax {

namespace {

const Message<void()> configureWithCurrentWorkout{"_configureWithCurrentWorkout"};

// One workout of the list, read as one element: the app that recorded it, its date in full, its figures.
class CHWorkoutsListTableViewCellAccessibility
    : public SafeCategory<CHWorkoutsListTableViewCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "CHWorkoutsListTableViewCell";
    manager.validateClassHasInstanceMethodWithFullSignature(target, "_configureWithCurrentWorkout", {"v"});
    manager.validateClassHasInstanceVariableWithType(target, "_workout", "Workout");
    manager.validateClassHasInstanceVariableWithType(target, "_dateLabel", "Label");
    manager.validateClassHasInstanceMethodWithFullSignature("Source", "_isNorvaleWatch", {"B"});
    manager.validateClassIsKindOfClass(target, "TableViewCell");
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() { return stringForAllChildren(self); }

  void _configureWithCurrentWorkout() {
    super(configureWithCurrentWorkout);
    messages::_accessibilityLoadAccessibilityInformation(self);
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    const Ref<Workout> workout = castAsClass<Workout>(self.safeValueForKey("_workout"_key));
    if (!workout) return;
    if (workout->sourceRevision()) nameSource(workout->sourceRevision()->source());
    if (!workout->startDate()) return;
    messages::setAccessibilityLabel(self.safeValueForKey("_dateLabel"_key),
                                    dateStringForFormat(workout->startDate(), "EEEE, MMM d, yyyy"));
  }

 private:
  void nameSource(const Ref<Source>& source) {
    if (!source || safeBoolForKey(source, "_isNorvaleWatch"_key) || isEmpty(source->name())) return;
    const Ref<TableViewCell> cell = castAsClass<TableViewCell>(self);
    if (!cell) return;
    messages::setAccessibilityLabel(cell->imageView(), source->name());
    messages::setIsAccessibilityElement(cell->imageView(), true);
  }
};

using C = CHWorkoutsListTableViewCellAccessibility;

const CategoryRegistration<C> registration{
    "CHWorkoutsListTableViewCellAccessibility",
    "CHWorkoutsListTableViewCell",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel),
     overrides<&C::_accessibilityLoadAccessibilityInformation>(
         messages::_accessibilityLoadAccessibilityInformation),
     overrides<&C::_configureWithCurrentWorkout>(configureWithCurrentWorkout)}};

}  // namespace

}  // namespace ax
