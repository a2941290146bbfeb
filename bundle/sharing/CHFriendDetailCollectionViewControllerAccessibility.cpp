#include "bundle/core/Category.h"
#include "bundle/sharing/MessageButton.h"

namespace ax {

namespace {

// A friend's page: its button for a new message is named as in the inbox. On the user's own page there is
// none.
class CHFriendDetailCollectionViewControllerAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_isMe", "B");
    contract.instanceMethod("_sendMessageButtonTapped:", {"v", "@"});
    contract.instanceMethod("viewDidLoad", {"v"});
    contract.isKindOf("ViewController");
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

}  // namespace

AX_CATEGORY(CHFriendDetailCollectionViewControllerAccessibility, "CHFriendDetailCollectionViewController")

}  // namespace ax
