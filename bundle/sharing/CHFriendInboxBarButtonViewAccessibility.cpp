#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/foundation/Formatters.h"

namespace ax {

namespace {

// The button that opens the inbox says how many items wait there.
class CHFriendInboxBarButtonViewAccessibility : public SafeCategory<CHFriendInboxBarButtonViewAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    manager.validateClassHasInstanceVariableWithType("CHFriendInboxBarButtonView", "_badgeView",
                                                     "CHFriendInboxBadgeView");
    manager.validateClassHasInstanceMethodWithFullSignature("CHFriendInboxBadgeView", "badgeText", {"@"});
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

using C = CHFriendInboxBarButtonViewAccessibility;

const CategoryRegistration<C> registration{
    "CHFriendInboxBarButtonViewAccessibility",
    "CHFriendInboxBarButtonView",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel),
     overrides<&C::accessibilityValue>(messages::accessibilityValue)}};

}  // namespace

}  // namespace ax
