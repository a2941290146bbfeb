#include "bundle/core/Category.h"
#include "platform/toolkit/Control.h"

namespace ax {

namespace {

// A row of two trends: the buttons over them say nothing that the trends do not.
class TrendPairTableViewCellAccessibility : public SafeCategory {
 public:
  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    const Ref<Array> buttons = _accessibilityFindUnsortedDescendantsPassingTest(
        self, [](Object& object) { return object.isKindOf(Button::staticClass()); });
    for (const Ref<Object>& button : *buttons) messages::setIsAccessibilityElement(button, false);
  }
};

}  // namespace

AX_CATEGORY(TrendPairTableViewCellAccessibility, "Velto.TrendPairTableViewCell")

}  // namespace ax
