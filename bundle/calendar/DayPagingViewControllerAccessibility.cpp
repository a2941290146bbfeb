#include "bundle/calendar/TodayButton.h"
#include "bundle/core/Category.h"

namespace ax {

namespace {

// The pager of the days: names its button in the navigation bar.
class DayPagingViewControllerAccessibility : public SafeCategory<DayPagingViewControllerAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    manager.validateClassHasInstanceMethodWithFullSignature("DayPagingViewController", "viewDidLoad", {"v"});
  }

  void viewDidLoad() {
    super(messages::viewDidLoad);
    labelTodayButton(self);
  }
};

using C = DayPagingViewControllerAccessibility;

const CategoryRegistration<C> registration{"DayPagingViewControllerAccessibility",
                                           "DayPagingViewController",
                                           {overrides<&C::viewDidLoad>(messages::viewDidLoad)}};

}  // namespace

}  // namespace ax
