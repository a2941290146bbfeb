#include "bundle/core/Category.h"
#include "platform/toolkit/ViewController.h"

namespace ax {

namespace {

// The week palette: nothing in it speaks but its weekday header.
class PaletteViewControllerAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_paletteView", "PaletteWeekdayHeaderView");
    contract.instanceMethod("viewDidLoad", {"v"});
  }

  void viewDidLoad() {
    super(messages::viewDidLoad);
    messages::_accessibilityLoadAccessibilityInformation(self);
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    const Ref<ViewController> controller = castAsClass<ViewController>(self);
    if (!controller) return;
    Ref<Object> palette = self.safeValueForKey("_paletteView"_key);
    if (palette.get() == &self) palette = nullptr;  // its view would keep the controller
    messages::setAccessibilityElements(messages::view(controller),
                                       axArrayByIgnoringNilElementsWithCount(1, {palette}));
  }
};

}  // namespace

AX_CATEGORY(PaletteViewControllerAccessibility, "PaletteViewController")

}  // namespace ax
