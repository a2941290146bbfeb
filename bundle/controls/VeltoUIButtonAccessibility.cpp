#include "bundle/core/Category.h"

namespace ax {

namespace {

// The toolkit's button speaks well enough by itself.
class VeltoUIButtonAccessibility : public SafeCategory {
 public:
};

}  // namespace

AX_CATEGORY(VeltoUIButtonAccessibility, "Button")

}  // namespace ax
