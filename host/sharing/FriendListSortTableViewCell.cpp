#include "host/sharing/FriendListSortTableViewCell.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& FriendListSortTableViewCell::staticClass() {
  using T = FriendListSortTableViewCell;
  static Class& result = ClassBuilder<T>("Velto.FriendListSortTableViewCell", TableViewCell::staticClass())
                             .instanceVariable<&T::sortButton_>("sortButton")
                             .build();
  return result;
}

void FriendListSortTableViewCell::layoutSubviews() {
  addUnplaced(*contentView(), {sortButton_});
}

static const RegisteredClass<FriendListSortTableViewCell> registered;

}  // namespace ax::host
