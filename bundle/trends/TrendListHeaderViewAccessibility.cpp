#include "bundle/core/Category.h"

namespace ax {

namespace {

// The heading of a list of trends, with all its headings in one.
class TrendListHeaderViewAccessibility : public SafeCategory<TrendListHeaderViewAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager&) {}

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return _accessibilityTextForSubhierarchyIncludingHeadersFocusableItemsExclusions(self, true, false,
                                                                                     nullptr);
  }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitHeader; }
};

using C = TrendListHeaderViewAccessibility;

const CategoryRegistration<C> registration{
    "TrendListHeaderViewAccessibility",
    "Velto.TrendListHeaderView",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel),
     overrides<&C::accessibilityTraits>(messages::accessibilityTraits)}};

}  // namespace

}  // namespace ax
