#include "bundle/core/Category.h"

namespace ax {

namespace {

// A row with one downward trend: one button, the trend and what is said about it.
class TrendingDownTableViewCellAccessibility : public SafeCategory<TrendingDownTableViewCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "Velto.TrendingDownTableViewCell";
    manager.validateClassHasInstanceMethodWithFullSignature(target, "view", {"@"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "detailLabel", {"@"});
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return labelForElements({self.safeValueForKey("view"_key), self.safeValueForKey("detailLabel"_key)});
  }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitButton; }
};

using C = TrendingDownTableViewCellAccessibility;

const CategoryRegistration<C> registration{
    "TrendingDownTableViewCellAccessibility",
    "Velto.TrendingDownTableViewCell",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel),
     overrides<&C::accessibilityTraits>(messages::accessibilityTraits)}};

}  // namespace

}  // namespace ax
