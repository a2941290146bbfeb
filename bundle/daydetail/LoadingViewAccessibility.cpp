#include "bundle/core/Category.h"

namespace ax {

namespace {

// Nothing behind the loading view can be reached while it shows.
class LoadingViewAccessibility : public SafeCategory<LoadingViewAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager&) {}

  bool accessibilityViewIsModal() { return true; }
};

using C = LoadingViewAccessibility;

const CategoryRegistration<C> registration{
    "LoadingViewAccessibility",
    "LoadingView",
    {overrides<&C::accessibilityViewIsModal>(messages::accessibilityViewIsModal)}};

}  // namespace

}  // namespace ax
