#include "bundle/core/Category.h"

namespace ax {

namespace {

// The screen in place of a heart rate: its link speaks once, as the button.
class CHNoHeartRateDataViewControllerAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("loadView", {"v"});
    contract.instanceMethod("titleLabel", {"@"});
    contract.instanceMethod("linkLabel", {"@"});
    contract.instanceMethod("linkButton", {"@"});
  }

  void loadView() {
    super(messages::loadView);
    messages::_accessibilityLoadAccessibilityInformation(self);
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    _accessibilityAddTrait(self.safeValueForKey("titleLabel"_key), TraitHeader);
    messages::setIsAccessibilityElement(self.safeValueForKey("linkLabel"_key), false);
    _setAccessibilityLabelBlock(self.safeValueForKey("linkButton"_key), [controller = Weak<Object>(self)] {
      const Ref<Object> screen = controller.lock();
      return labelOfPart(safeValueForKey(screen, "linkButton"_key), safeValueForKey(screen, "linkLabel"_key));
    });
  }
};

}  // namespace

AX_CATEGORY(CHNoHeartRateDataViewControllerAccessibility, "CHNoHeartRateDataViewController")

}  // namespace ax
