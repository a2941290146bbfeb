#include "bundle/core/Category.h"

namespace ax {

namespace {

// What a trend's own screen says about it, in one stop and without its headings.
class TrendDetailSummaryViewAccessibility : public SafeCategory<TrendDetailSummaryViewAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager&) {}

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return _accessibilityTextForSubhierarchyIncludingHeadersFocusableItemsExclusions(self, false, true,
                                                                                     nullptr);
  }
};

using C = TrendDetailSummaryViewAccessibility;

const CategoryRegistration<C> registration{
    "TrendDetailSummaryViewAccessibility",
    "Velto.TrendDetailSummaryView",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel)}};

}  // namespace

}  // namespace ax
