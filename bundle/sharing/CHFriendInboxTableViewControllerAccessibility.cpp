#include "bundle/core/Category.h"
#include "bundle/sharing/MessageButton.h"

namespace ax {

namespace {

// The inbox: its button for a new message is named and explained.
class CHFriendInboxTableViewControllerAccessibility
    : public SafeCategory<CHFriendInboxTableViewControllerAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "CHFriendInboxTableViewController";
    manager.validateClassIsKindOfClass(target, "ViewController");
    manager.validateClassHasInstanceMethodWithFullSignature(target, "viewDidLoad", {"v"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "_sendMessageButtonTapped:", {"v", "@"});
  }

  void viewDidLoad() {
    super(messages::viewDidLoad);
    messages::_accessibilityLoadAccessibilityInformation(self);
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    nameMessageButton(self);
  }
};

using C = CHFriendInboxTableViewControllerAccessibility;

const CategoryRegistration<C> registration{"CHFriendInboxTableViewControllerAccessibility",
                                           "CHFriendInboxTableViewController",
                                           {overrides<&C::viewDidLoad>(messages::viewDidLoad),
                                            overrides<&C::_accessibilityLoadAccessibilityInformation>(
                                                messages::_accessibilityLoadAccessibilityInformation)}};

}  // namespace

}  // namespace ax
