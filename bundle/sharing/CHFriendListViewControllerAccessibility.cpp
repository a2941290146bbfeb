#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/toolkit/ViewController.h"

namespace ax {

namespace {

// The list of friends: its sort button says what it does and which order is chosen.
class CHFriendListViewControllerAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_sortBarButtonItem", "BarButtonItem");
    contract.instanceMethod("viewDidLoad", {"v"});
  }

  void viewDidLoad() {
    super(messages::viewDidLoad);
    messages::_accessibilityLoadAccessibilityInformation(self);
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    const Ref<BarButtonItem> item =
        castAsClass<BarButtonItem>(self.safeValueForKey("_sortBarButtonItem"_key));
    _setAccessibilityLabelBlock(item, [] { return accessibilityLocalizedString("sort.by.options"); });
    _setAccessibilityValueBlock(item,
                                [weak = Weak<BarButtonItem>(item)] { return messages::title(weak.lock()); });
  }
};

}  // namespace

AX_CATEGORY(CHFriendListViewControllerAccessibility, "CHFriendListViewController")

}  // namespace ax
