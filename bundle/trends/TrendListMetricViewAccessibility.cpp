#include "bundle/core/Category.h"

namespace ax {

namespace {

// One measure with its trend: a button that says title, trend and value.
class TrendListMetricViewAccessibility : public SafeCategory<TrendListMetricViewAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "Velto.TrendListMetricView";
    manager.validateClassHasInstanceMethodWithFullSignature(target, "titleLabel", {"@"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "trendString", {"@"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "valueLabel", {"@"});
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return labelForElements({self.safeValueForKey("titleLabel"_key),
                             safeStringForKey(self, "trendString"_key),
                             self.safeValueForKey("valueLabel"_key)});
  }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitButton; }
};

using C = TrendListMetricViewAccessibility;

const CategoryRegistration<C> registration{
    "TrendListMetricViewAccessibility",
    "Velto.TrendListMetricView",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel),
     overrides<&C::accessibilityTraits>(messages::accessibilityTraits)}};

}  // namespace

}  // namespace ax
