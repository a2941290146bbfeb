#include "bundle/core/Category.h"

namespace ax {

namespace {

// The screen in place of a heart rate: its link speaks once, as the button.
class CHNoHeartRateDataViewControllerAccessibility
    : public SafeCategory<CHNoHeartRateDataViewControllerAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "CHNoHeartRateDataViewController";
    manager.validateClassHasInstanceMethodWithFullSignature(target, "loadView", {"v"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "titleLabel", {"@"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "linkLabel", {"@"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "linkButton", {"@"});
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

using C = CHNoHeartRateDataViewControllerAccessibility;

const CategoryRegistration<C> registration{
    "CHNoHeartRateDataViewControllerAccessibility",
    "CHNoHeartRateDataViewController",
    {overrides<&C::loadView>(messages::loadView), overrides<&C::_accessibilityLoadAccessibilityInformation>(
                                                      messages::_accessibilityLoadAccessibilityInformation)}};

}  // namespace

}  // namespace ax
