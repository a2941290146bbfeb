#include "bundle/core/Category.h"
#include "platform/toolkit/ViewController.h"

namespace ax {

namespace {

// The week palette: nothing in it speaks but its weekday header.
class PaletteViewControllerAccessibility : public SafeCategory<PaletteViewControllerAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "PaletteViewController";
    manager.validateClassHasInstanceVariableWithType(target, "_paletteView", "PaletteWeekdayHeaderView");
    manager.validateClassHasInstanceMethodWithFullSignature(target, "viewDidLoad", {"v"});
  }

  void viewDidLoad() {
    super(messages::viewDidLoad);
    messages::_accessibilityLoadAccessibilityInformation(self);
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    const Ref<ViewController> controller = castAsClass<ViewController>(self);
    if (!controller) return;
    messages::setAccessibilityElements(
        messages::view(controller),
        axArrayByIgnoringNilElementsWithCount(1, {self.safeValueForKey("_paletteView"_key)}));
  }
};

using C = PaletteViewControllerAccessibility;

const CategoryRegistration<C> registration{"PaletteViewControllerAccessibility",
                                           "PaletteViewController",
                                           {overrides<&C::viewDidLoad>(messages::viewDidLoad),
                                            overrides<&C::_accessibilityLoadAccessibilityInformation>(
                                                messages::_accessibilityLoadAccessibilityInformation)}};

}  // namespace

}  // namespace ax
