#include "bundle/core/Category.h"

namespace ax {

namespace {

// What a trend's own screen says about it, in one stop and without its headings.
class TrendDetailSummaryViewAccessibility : public SafeCategory {
 public:
  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return _accessibilityTextForSubhierarchyIncludingHeadersFocusableItemsExclusions(self, false, true,
                                                                                     nullptr);
  }
};

}  // namespace

AX_CATEGORY(TrendDetailSummaryViewAccessibility, "Velto.TrendDetailSummaryView")

}  // namespace ax
