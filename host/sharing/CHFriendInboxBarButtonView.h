#pragma once

#include "platform/toolkit/Control.h"
#include "platform/toolkit/Label.h"

namespace ax::host {

// The red dot with the number of items that wait.
class CHFriendInboxBadgeView : public View {
 public:
  static Class& staticClass();

  const Ref<String>& badgeText() const { return badgeText_; }
  // Without a text, or with the digit 0, the badge is hidden.
  void setBadgeText(Ref<String> text);

 private:
  Ref<String> badgeText_;
};

// The button of the navigation bar that opens the inbox.
class CHFriendInboxBarButtonView : public Button {
 public:
  static Class& staticClass();

  void layoutSubviews() override;

 private:
  Ref<CHFriendInboxBadgeView> badgeView_;
};

}  // namespace ax::host
