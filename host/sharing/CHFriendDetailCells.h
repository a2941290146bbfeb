#pragma once

#include "platform/toolkit/Label.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// One goal of a friend: a title over what has been done of it.
class CHFriendDetailGoalCell : public CollectionViewCell {
 public:
  static Class& staticClass();

  void layoutSubviews() override;

 private:
  Ref<Label> titleLabel_;
  Ref<Label> subtitleLabel_;
};

// One thing to do with a friend.
class CHFriendDetailActionCell : public CollectionViewCell {
 public:
  static Class& staticClass();

  void layoutSubviews() override;

 private:
  Ref<Label> actionTitleLabel_;
};

}  // namespace ax::host
