#include "bundle/core/Category.h"
#include "platform/toolkit/Control.h"

namespace ax {

namespace {

// A row of two trends: the buttons over them say nothing that the trends do not.
class TrendPairTableViewCellAccessibility : public SafeCategory<TrendPairTableViewCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager&) {}

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    const Ref<Array> buttons = _accessibilityFindUnsortedDescendantsPassingTest(
        self, [](Object& object) { return object.isKindOf(Button::staticClass()); });
    for (const Ref<Object>& button : *buttons) messages::setIsAccessibilityElement(button, false);
  }
};

using C = TrendPairTableViewCellAccessibility;

const CategoryRegistration<C> registration{"TrendPairTableViewCellAccessibility",
                                           "Velto.TrendPairTableViewCell",
                                           {overrides<&C::_accessibilityLoadAccessibilityInformation>(
                                               messages::_accessibilityLoadAccessibilityInformation)}};

}  // namespace

}  // namespace ax
