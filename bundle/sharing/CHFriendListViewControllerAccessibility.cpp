#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/toolkit/ViewController.h"

namespace ax {

namespace {

// The list of friends: its sort button says what it does and which order is chosen.
class CHFriendListViewControllerAccessibility : public SafeCategory<CHFriendListViewControllerAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "CHFriendListViewController";
    manager.validateClassHasInstanceVariableWithType(target, "_sortBarButtonItem", "BarButtonItem");
    manager.validateClassHasInstanceMethodWithFullSignature(target, "viewDidLoad", {"v"});
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

using C = CHFriendListViewControllerAccessibility;

const CategoryRegistration<C> registration{"CHFriendListViewControllerAccessibility",
                                           "CHFriendListViewController",
                                           {overrides<&C::viewDidLoad>(messages::viewDidLoad),
                                            overrides<&C::_accessibilityLoadAccessibilityInformation>(
                                                messages::_accessibilityLoadAccessibilityInformation)}};

}  // namespace

}  // namespace ax
