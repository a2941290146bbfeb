#include "bundle/core/Category.h"

namespace ax {

namespace {

// A row of upward trends: its two halves are the buttons, not the row.
class TrendingUpTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("leadingView", {"@"});
    contract.instanceMethod("trailingView", {"@"});
  }

  bool isAccessibilityElement() { return false; }

  Ref<Array> accessibilityElements() {
    Array::Items halves;
    for (const Key key : {"leadingView"_key, "trailingView"_key}) {
      const Ref<Object> half = self.safeValueForKey(key);
      if (messages::accessibilityLabel(half)) halves.push_back(half);
    }
    for (const Ref<Object>& half : halves) _accessibilityAddTrait(half, TraitButton);
    return array(std::move(halves));
  }
};

}  // namespace

AX_CATEGORY(TrendingUpTableViewCellAccessibility, "Velto.TrendingUpTableViewCell")

}  // namespace ax
