#include "bundle/core/Category.h"

namespace ax {

namespace {

// One measure with its trend: a button that says title, trend and value.
class TrendListMetricViewAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("titleLabel", {"@"});
    contract.instanceMethod("trendString", {"@"});
    contract.instanceMethod("valueLabel", {"@"});
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return labelForElements({self.safeValueForKey("titleLabel"_key),
                             safeStringForKey(self, "trendString"_key),
                             self.safeValueForKey("valueLabel"_key)});
  }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitButton; }
};

}  // namespace

AX_CATEGORY(TrendListMetricViewAccessibility, "Velto.TrendListMetricView")

}  // namespace ax
