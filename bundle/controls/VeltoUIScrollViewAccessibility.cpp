#include "bundle/core/Category.h"

namespace ax {

namespace {

// The toolkit's scroll view speaks well enough by itself.
class VeltoUIScrollViewAccessibility : public SafeCategory {
 public:
};

}  // namespace

AX_CATEGORY(VeltoUIScrollViewAccessibility, "ScrollView")

}  // namespace ax
