#include "bundle/core/Category.h"
#include "bundle/sharing/MessageButton.h"

namespace ax {

namespace {

// The inbox: its button for a new message is named and explained.
class CHFriendInboxTableViewControllerAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.isKindOf("ViewController");
    contract.instanceMethod("viewDidLoad", {"v"});
    contract.instanceMethod("_sendMessageButtonTapped:", {"v", "@"});
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

}  // namespace

AX_CATEGORY(CHFriendInboxTableViewControllerAccessibility, "CHFriendInboxTableViewController")

}  // namespace ax
