#include "bundle/core/Category.h"

namespace ax {

namespace {

// A row with one downward trend: one button, the trend and what is said about it.
class TrendingDownTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("view", {"@"});
    contract.instanceMethod("detailLabel", {"@"});
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return labelForElements({self.safeValueForKey("view"_key), self.safeValueForKey("detailLabel"_key)});
  }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitButton; }
};

}  // namespace

AX_CATEGORY(TrendingDownTableViewCellAccessibility, "Velto.TrendingDownTableViewCell")

}  // namespace ax
