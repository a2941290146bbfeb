#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/foundation/Formatters.h"

namespace ax {

namespace {

// The button that opens the inbox says how many items wait there.
class CHFriendInboxBarButtonViewAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_badgeView", "CHFriendInboxBadgeView");
    contract.of("CHFriendInboxBadgeView").instanceMethod("badgeText", {"@"});
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() { return accessibilityLocalizedString("friend.list"); }

  Ref<String> accessibilityValue() {
    const std::int32_t count = waitingItems();
    if (count < 1) return nullptr;
    return stringWithFormat(accessibilityLocalizedString("badge.format"), {number(count)});
  }

 private:
  // A text that is no number counts nothing.
  std::int32_t waitingItems() {
    const Ref<String> text = safeStringForKey(self.safeValueForKey("_badgeView"_key), "badgeText"_key);
    const Ref<Number> count = make<NumberFormatter>()->numberFromString(text);
    return count ? count->intValue() : 0;
  }
};

}  // namespace

AX_CATEGORY(CHFriendInboxBarButtonViewAccessibility, "CHFriendInboxBarButtonView")

}  // namespace ax
