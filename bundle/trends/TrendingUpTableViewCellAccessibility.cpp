#include "bundle/core/Category.h"

namespace ax {

namespace {

// A row of upward trends: its two halves are the buttons, not the row.
class TrendingUpTableViewCellAccessibility : public SafeCategory<TrendingUpTableViewCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "Velto.TrendingUpTableViewCell";
    manager.validateClassHasInstanceMethodWithFullSignature(target, "leadingView", {"@"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "trailingView", {"@"});
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

using C = TrendingUpTableViewCellAccessibility;

const CategoryRegistration<C> registration{
    "TrendingUpTableViewCellAccessibility",
    "Velto.TrendingUpTableViewCell",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityElements>(messages::accessibilityElements)}};

}  // namespace

}  // namespace ax
