#pragma once

#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// The points of the user and of a friend. It says them itself: "1,200 to 900".
class ASCompetitionScoreView : public View {
 public:
  static Class& staticClass();

 protected:
  Ref<String> defaultLabel() override;

 private:
  std::int64_t myScore_ = 0;
  std::int64_t friendScore_ = 0;
};

// The row of one competition: the score over the days that remain.
class CHFriendListCompetitionTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  void layoutSubviews() override;

 private:
  Ref<Label> daysRemainingLabel_;
  Ref<ASCompetitionScoreView> scoreView_;
};

}  // namespace ax::host
