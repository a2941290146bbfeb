#include "bundle/core/Category.h"

namespace ax {

namespace {

// A key beside its value: one element that speaks both.
class PairedLabelsAccessibility : public SafeCategory<PairedLabelsAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    manager.validateClassHasInstanceMethodWithFullSignature("_PairedLabels", "valueLabel", {"@"});
    manager.validateClassHasInstanceMethodWithFullSignature("_PairedLabels", "keyLabel", {"@"});
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return stringForVariables({labelOfPart(self, self.safeValueForKey("keyLabel"_key)),
                               labelOfPart(self, self.safeValueForKey("valueLabel"_key)),
                               stringForVariablesSentinel});
  }
};

using C = PairedLabelsAccessibility;

const CategoryRegistration<C> registration{
    "_PairedLabelsAccessibility",
    "_PairedLabels",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel)}};

}  // namespace

}  // namespace ax
