#include "bundle/core/Category.h"
#include "bundle/workouts/SummaryLabelAttribute.h"
#include "platform/foundation/AttributedString.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax {

namespace {

constinit const Message<void()> updateUI{"_updateUI"};

// The summary on top of a workout: all its figures, the duration spoken as one.
class CHWorkoutSummaryTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_durationLabel", "_CHWorkoutSummaryTabbedLabelContainer");
    contract.instanceMethod("_updateUI", {"v"});
  }

  Ref<String> accessibilityLabel() {
    const Ref<TableViewCell> cell = castAsClass<TableViewCell>(self);
    const Ref<Array> shown = messages::subviews(messages::contentView(cell));
    return shown && !shown->isEmpty() ? labelForElements(shown) : super(messages::accessibilityLabel);
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    const Ref<Object> duration =
        safeClass("_CHWorkoutSummaryTabbedLabelContainer"_key, self.safeValueForKey("_durationLabel"_key));
    messages::_accessibilitySetLabelAttribute(duration, string(std::string(DurationTimeHHMMSS.name())));
  }

  void _updateUI() {
    super(updateUI);
    messages::_accessibilityLoadAccessibilityInformation(self);
  }
};

}  // namespace

AX_CATEGORY(CHWorkoutSummaryTableViewCellAccessibility, "CHWorkoutSummaryTableViewCell",
            overrides<&C::_updateUI>(updateUI))

}  // namespace ax
