#include "host/sharing/CHFriendListTableViewCell.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

const Message<void(Ref<Object>, Ref<Object>, Ref<Object>, bool)> setFriend{
    "setFriend:snapshot:formattingManager:animated:"};

Ref<String> nameLine(const Friend& shown) {
  return shown.hasNews() && shown.name() ? string("\u2022 " + shown.name()->text()) : shown.name();
}

void showLine(Ref<Label>& label, const Ref<String>& line) {
  if (!label) label = make<Label>();
  label->setText(line);
}

}  // namespace

Class& CHFriendListTableViewCell::staticClass() {
  using T = CHFriendListTableViewCell;
  static Class& result =
      ClassBuilder<T>("CHFriendListTableViewCell", TableViewCell::staticClass())
          .instanceVariable<&T::friend_>("_friend")
          .instanceVariable<&T::snapshot_>("_snapshot")
          .property<&T::detailLineOneLabel, &T::setDetailLineOneLabel>("detailLineOneLabel")
          .property<&T::detailLineTwoLabel, &T::setDetailLineTwoLabel>("detailLineTwoLabel")
          .property<&T::competitionBadgeView, &T::setCompetitionBadgeView>("competitionBadgeView")
          .method<&T::setFriendSnapshotFormattingManagerAnimated>(
              "setFriend:snapshot:formattingManager:animated:")
          .build();
  return result;
}

void CHFriendListTableViewCell::setCompetitionBadgeView(Ref<View> view) {
  if (competitionBadgeView_ && competitionBadgeView_ != view) competitionBadgeView_->removeFromSuperview();
  competitionBadgeView_ = std::move(view);
}

void CHFriendListTableViewCell::setFriendSnapshotFormattingManagerAnimated(Ref<Friend> shown,
                                                                           Ref<FriendSnapshot> snapshot,
                                                                           Ref<Object>, bool) {
  friend_ = shown;
  snapshot_ = snapshot;
  isShown_ = true;
  if (!textLabel()) setTextLabel(make<Label>());
  textLabel()->setText(shown ? nameLine(*shown) : nullptr);
  showLine(detailLineOneLabel_, snapshot ? snapshot->lineOne() : nullptr);
  showLine(detailLineTwoLabel_, snapshot ? snapshot->lineTwo() : nullptr);
  const bool isCompeting = shown && shown->isCompeting();
  if (isCompeting != bool(competitionBadgeView_))
    setCompetitionBadgeView(isCompeting ? make<ImageView>() : nullptr);
  layoutSubviews();
}

void CHFriendListTableViewCell::layoutSubviews() {
  if (friend_ && !isShown_) setFriend(*this, friend_, snapshot_, nullptr, false);
  addUnplaced(*contentView(), {detailLineOneLabel_, detailLineTwoLabel_, competitionBadgeView_});
}

static const RegisteredClass<CHFriendListTableViewCell> registered;

}  // namespace ax::host
