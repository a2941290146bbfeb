#include "bundle/core/Category.h"
#include "bundle/sharing/MessageButton.h"

namespace ax {

namespace {

// A friend's page: its button for a new message is named as in the inbox. On the user's own page there is
// none.
class CHFriendDetailCollectionViewControllerAccessibility
    : public SafeCategory<CHFriendDetailCollectionViewControllerAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "CHFriendDetailCollectionViewController";
    manager.validateClassHasInstanceVariableWithType(target, "_isMe", "B");
    manager.validateClassHasInstanceMethodWithFullSignature(target, "_sendMessageButtonTapped:", {"v", "@"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "viewDidLoad", {"v"});
    manager.validateClassIsKindOfClass(target, "ViewController");
  }

  void viewDidLoad() {
    super(messages::viewDidLoad);
    messages::_accessibilityLoadAccessibilityInformation(self);
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    if (!self.safeBoolForKey("_isMe"_key)) nameMessageButton(self);
  }
};

using C = CHFriendDetailCollectionViewControllerAccessibility;

const CategoryRegistration<C> registration{"CHFriendDetailCollectionViewControllerAccessibility",
                                           "CHFriendDetailCollectionViewController",
                                           {overrides<&C::viewDidLoad>(messages::viewDidLoad),
                                            overrides<&C::_accessibilityLoadAccessibilityInformation>(
                                                messages::_accessibilityLoadAccessibilityInformation)}};

}  // namespace

}  // namespace ax
