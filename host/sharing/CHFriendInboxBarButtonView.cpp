#include "host/sharing/CHFriendInboxBarButtonView.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHFriendInboxBadgeView::staticClass() {
  using T = CHFriendInboxBadgeView;
  static Class& result = ClassBuilder<T>("CHFriendInboxBadgeView", View::staticClass())
                             .property<&T::badgeText, &T::setBadgeText>("badgeText")
                             .build();
  return result;
}

void CHFriendInboxBadgeView::setBadgeText(Ref<String> text) {
  badgeText_ = std::move(text);
  setHidden(isEmpty(badgeText_) || badgeText_->text() == "0");
}

Class& CHFriendInboxBarButtonView::staticClass() {
  using T = CHFriendInboxBarButtonView;
  static Class& result = ClassBuilder<T>("CHFriendInboxBarButtonView", Button::staticClass())
                             .instanceVariable<&T::badgeView_>("_badgeView")
                             .build();
  return result;
}

void CHFriendInboxBarButtonView::layoutSubviews() {
  addUnplaced(*this, {badgeView_});
}

static const RegisteredClass<CHFriendInboxBadgeView> registeredBadge;
static const RegisteredClass<CHFriendInboxBarButtonView> registered;

}  // namespace ax::host
