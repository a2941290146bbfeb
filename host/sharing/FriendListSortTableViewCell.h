#pragma once

#include "platform/toolkit/Control.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// The row above the friends with the button that sorts them: "Velto.FriendListSortTableViewCell".
class FriendListSortTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  void layoutSubviews() override;

 private:
  Ref<Button> sortButton_;
};

}  // namespace ax::host
