#include "bundle/core/Category.h"

namespace ax {

namespace {

// A key beside its value: one element that speaks both.
class PairedLabelsAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("valueLabel", {"@"});
    contract.instanceMethod("keyLabel", {"@"});
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return stringForVariables({labelOfPart(self, self.safeValueForKey("keyLabel"_key)),
                               labelOfPart(self, self.safeValueForKey("valueLabel"_key)),
                               stringForVariablesSentinel});
  }
};

}  // namespace

AX_CATEGORY(PairedLabelsAccessibility, "_PairedLabels")

}  // namespace ax
