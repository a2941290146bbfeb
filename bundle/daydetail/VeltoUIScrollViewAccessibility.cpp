#include "bundle/core/Category.h"

namespace ax {

namespace {

// The toolkit's scroll view speaks well enough by itself.
class VeltoUIScrollViewAccessibility : public SafeCategory<VeltoUIScrollViewAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager&) {}
};

using C = VeltoUIScrollViewAccessibility;

const CategoryRegistration<C> registration{"VeltoUIScrollViewAccessibility", "ScrollView", {}};

}  // namespace

}  // namespace ax
