#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax {

namespace {

constinit const Message<void(Ref<Object>, Ref<Object>, Ref<Object>, bool)> setFriend{
    "setFriend:snapshot:formattingManager:animated:"};

// The row of one friend: one element, labelled anew each time the list shows a friend in it.
class CHFriendListTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.isKindOf("TableViewCell");
    contract.instanceMethod("detailLineOneLabel", {"@"});
    contract.instanceMethod("detailLineTwoLabel", {"@"});
    contract.instanceMethod("competitionBadgeView", {"@"});
    contract.instanceMethod("setFriend:snapshot:formattingManager:animated:", {"v", "@", "@", "@", "B"});
  }

  bool isAccessibilityElement() { return true; }

  void setFriendSnapshotFormattingManagerAnimated(Ref<Object> shown, Ref<Object> snapshot,
                                                  Ref<Object> formattingManager, bool animated) {
    super(setFriend, shown, snapshot, formattingManager, animated);
    messages::_accessibilityLoadAccessibilityInformation(self);
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    const Ref<Label> name = messages::textLabel(castAsClass<TableViewCell>(self));
    if (!name) return;
    const Ref<Object> lineOne = self.safeValueForKey("detailLineOneLabel"_key);
    const Ref<Object> lineTwo = self.safeValueForKey("detailLineTwoLabel"_key);
    const Ref<Object> badge = self.safeValueForKey("competitionBadgeView"_key);
    messages::setIsAccessibilityElement(badge, true);
    messages::setAccessibilityLabel(badge, accessibilityLocalizedString("competition.in.progress"));
    speakWithoutBullets(*name);
    messages::setAccessibilityLabel(
        self, labelForElements(axArrayByIgnoringNilElementsWithCount(4, {name, lineOne, lineTwo, badge})));
  }

 private:
  static void speakWithoutBullets(Label& label) {
    _setAccessibilityLabelBlock(label, [weak = Weak<Label>(label)] {
      return stringByRemoving(messages::text(weak.lock()), "\u2022");
    });
  }
};

}  // namespace

AX_CATEGORY(CHFriendListTableViewCellAccessibility, "CHFriendListTableViewCell",
            overrides<&C::setFriendSnapshotFormattingManagerAnimated>(setFriend))

}  // namespace ax
