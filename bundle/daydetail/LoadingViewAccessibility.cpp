#include "bundle/core/Category.h"

namespace ax {

namespace {

// Nothing behind the loading view can be reached while it shows.
class LoadingViewAccessibility : public SafeCategory {
 public:
  bool accessibilityViewIsModal() { return true; }
};

}  // namespace

AX_CATEGORY(LoadingViewAccessibility, "LoadingView")

}  // namespace ax
