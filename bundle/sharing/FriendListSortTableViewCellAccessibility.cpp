#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/toolkit/Control.h"

namespace ax {

namespace {

// The row that sorts the friends: its button says what it is for.
class FriendListSortTableViewCellAccessibility : public SafeCategory {
 public:
  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    const Ref<Array> buttons = _accessibilityFindUnsortedDescendantsPassingTest(
        self, [](Object& object) { return cast<Button>(&object) != nullptr; });
    messages::setAccessibilityLabel(buttons->firstObject(), accessibilityLocalizedString("sort.button"));
  }
};

}  // namespace

AX_CATEGORY(FriendListSortTableViewCellAccessibility, "Velto.FriendListSortTableViewCell")

}  // namespace ax
