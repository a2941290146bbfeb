#include "bundle/core/Category.h"

namespace ax {

namespace {

// The toolkit's button speaks well enough by itself.
class VeltoUIButtonAccessibility : public SafeCategory<VeltoUIButtonAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager&) {}
};

using C = VeltoUIButtonAccessibility;

const CategoryRegistration<C> registration{"VeltoUIButtonAccessibility", "Button", {}};

}  // namespace

}  // namespace ax
