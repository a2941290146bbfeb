#include "bundle/core/Category.h"

namespace ax {

namespace {

// The scrolling part of the month screen.
class MonthScrollViewControllerAccessibility : public SafeCategory<MonthScrollViewControllerAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "MonthScrollViewController";
    manager.validateClassHasInstanceMethodWithFullSignature(target, "viewDidLoad", {"v"});
    manager.validateClassHasInstanceVariableWithType(target, "_scrollView", "ScrollView");
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

using C = MonthScrollViewControllerAccessibility;

const CategoryRegistration<C> registration{"MonthScrollViewControllerAccessibility",
                                           "MonthScrollViewController",
                                           {overrides<&C::viewDidLoad>(messages::viewDidLoad),
                                            overrides<&C::_accessibilityLoadAccessibilityInformation>(
                                                messages::_accessibilityLoadAccessibilityInformation)}};

}  // namespace

}  // namespace ax
