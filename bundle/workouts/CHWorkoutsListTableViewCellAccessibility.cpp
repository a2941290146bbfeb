#include "bundle/core/Category.h"
#include "platform/foundation/Formatters.h"
#include "platform/health/Workout.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax {

namespace {

constinit const Message<void()> configureWithCurrentWorkout{"_configureWithCurrentWorkout"};

// One workout of the list, read as one element: the app that recorded it, its date in full, its figures.
class CHWorkoutsListTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("_configureWithCurrentWorkout", {"v"});
    contract.instanceVariable("_workout", "Workout");
    contract.instanceVariable("_dateLabel", "Label");
    contract.of("Source").instanceMethod("_isNorvaleWatch", {"B"});
    contract.isKindOf("TableViewCell");
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
    nameSource(safeValueForKey(workout->safeValueForKey("sourceRevision"_key), "source"_key));
    const Ref<Date> start = castAsClass<Date>(workout->safeValueForKey("startDate"_key));
    if (!start) return;
    messages::setAccessibilityLabel(self.safeValueForKey("_dateLabel"_key),
                                    dateStringForFormat(start, "EEEE, MMM d, yyyy"));
  }

 private:
  void nameSource(const Ref<Object>& source) {
    const Ref<String> name = safeStringForKey(source, "name"_key);
    if (isEmpty(name) || safeBoolForKey(source, "_isNorvaleWatch"_key)) return;
    const Ref<ImageView> icon = messages::imageView(castAsClass<TableViewCell>(self));
    messages::setAccessibilityLabel(icon, name);
    messages::setIsAccessibilityElement(icon, true);
  }
};

}  // namespace

AX_CATEGORY(CHWorkoutsListTableViewCellAccessibility, "CHWorkoutsListTableViewCell",
            overrides<&C::_configureWithCurrentWorkout>(configureWithCurrentWorkout))

}  // namespace ax
