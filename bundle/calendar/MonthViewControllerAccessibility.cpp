#include "bundle/calendar/TodayButton.h"
#include "bundle/core/Category.h"

namespace ax {

namespace {

// The screen of the months: names its button in the navigation bar.
class MonthViewControllerAccessibility : public SafeCategory<MonthViewControllerAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    manager.validateClassHasInstanceMethodWithFullSignature("MonthViewController", "viewDidLoad", {"v"});
  }

  void viewDidLoad() {
    super(messages::viewDidLoad);
    labelTodayButton(self);
  }
};

using C = MonthViewControllerAccessibility;

const CategoryRegistration<C> registration{"MonthViewControllerAccessibility",
                                           "MonthViewController",
                                           {overrides<&C::viewDidLoad>(messages::viewDidLoad)}};

}  // namespace

}  // namespace ax
