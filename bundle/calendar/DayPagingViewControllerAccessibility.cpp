#include "bundle/calendar/TodayButton.h"
#include "bundle/core/Category.h"

namespace ax {

namespace {

// The pager of the days: names its button in the navigation bar.
class DayPagingViewControllerAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("viewDidLoad", {"v"});
  }

  void viewDidLoad() {
    super(messages::viewDidLoad);
    labelTodayButton(self);
  }
};

}  // namespace

AX_CATEGORY(DayPagingViewControllerAccessibility, "DayPagingViewController")

}  // namespace ax
