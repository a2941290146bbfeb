#include "host/sharing/CHFriendDetailCells.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHFriendDetailGoalCell::staticClass() {
  using T = CHFriendDetailGoalCell;
  static Class& result = ClassBuilder<T>("CHFriendDetailGoalCell", CollectionViewCell::staticClass())
                             .instanceVariable<&T::titleLabel_>("_titleLabel")
                             .instanceVariable<&T::subtitleLabel_>("_subtitleLabel")
                             .build();
  return result;
}

void CHFriendDetailGoalCell::layoutSubviews() {
  addUnplaced(*this, {titleLabel_, subtitleLabel_});
}

Class& CHFriendDetailActionCell::staticClass() {
  using T = CHFriendDetailActionCell;
  static Class& result = ClassBuilder<T>("CHFriendDetailActionCell", CollectionViewCell::staticClass())
                             .instanceVariable<&T::actionTitleLabel_>("_actionTitleLabel")
                             .build();
  return result;
}

void CHFriendDetailActionCell::layoutSubviews() {
  addUnplaced(*this, {actionTitleLabel_});
}

static const RegisteredClass<CHFriendDetailGoalCell> registeredGoalCell;
static const RegisteredClass<CHFriendDetailActionCell> registeredActionCell;

}  // namespace ax::host
