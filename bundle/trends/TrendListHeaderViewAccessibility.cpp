#include "bundle/core/Category.h"

namespace ax {

namespace {

// The heading of a list of trends, with all its headings in one.
class TrendListHeaderViewAccessibility : public SafeCategory {
 public:
  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return _accessibilityTextForSubhierarchyIncludingHeadersFocusableItemsExclusions(self, true, false,
                                                                                     nullptr);
  }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitHeader; }
};

}  // namespace

AX_CATEGORY(TrendListHeaderViewAccessibility, "Velto.TrendListHeaderView")

}  // namespace ax
