#pragma once

#include "host/sharing/Friend.h"
#include "platform/toolkit/ImageView.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// The row of one friend: the name, two lines of the day, and a badge while a competition is in progress. The
// list uses a row again for other friends.
class CHFriendListTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  const Ref<Label>& detailLineOneLabel() const { return detailLineOneLabel_; }
  void setDetailLineOneLabel(Ref<Label> label) { detailLineOneLabel_ = std::move(label); }
  const Ref<Label>& detailLineTwoLabel() const { return detailLineTwoLabel_; }
  void setDetailLineTwoLabel(Ref<Label> label) { detailLineTwoLabel_ = std::move(label); }
  // Nil for a friend who does not compete.
  const Ref<View>& competitionBadgeView() const { return competitionBadgeView_; }
  void setCompetitionBadgeView(Ref<View> view);

  // Shows a friend. A bullet before the name says that there is news.
  void setFriendSnapshotFormattingManagerAnimated(Ref<Friend> shown, Ref<FriendSnapshot> snapshot,
                                                  Ref<Object> formattingManager, bool animated);
  // Shows the friend that the row was given as a member, if it has not yet.
  void layoutSubviews() override;

 private:
  Ref<Friend> friend_;
  Ref<FriendSnapshot> snapshot_;
  bool isShown_ = false;
  Ref<Label> detailLineOneLabel_;
  Ref<Label> detailLineTwoLabel_;
  Ref<View> competitionBadgeView_;
};

}  // namespace ax::host
