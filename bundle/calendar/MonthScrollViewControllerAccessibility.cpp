#include "bundle/core/Category.h"

namespace ax {

namespace {

// The scrolling part of the month screen.
class MonthScrollViewControllerAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("viewDidLoad", {"v"});
    contract.instanceVariable("_scrollView", "ScrollView");
  }

  void viewDidLoad() {
    super(messages::viewDidLoad);
    messages::_accessibilityLoadAccessibilityInformation(self);
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    accessibilitySetIdentification(self.safeValueForKey("_scrollView"_key), string("WorstScrollViewEver"));
  }
};

}  // namespace

AX_CATEGORY(MonthScrollViewControllerAccessibility, "MonthScrollViewController")

}  // namespace ax
