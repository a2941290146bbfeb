#pragma once

#include "host/achievements/ODUIBadgeView.h"
#include "platform/toolkit/Label.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// One badge of the grid. The cell may also hold something that is no achievement, while it loads.
class CHAchievementCollectionViewCell : public CollectionViewCell {
 public:
  static Class& staticClass();

  const Ref<Object>& achievement() const { return achievement_; }
  void setAchievement(Ref<Object> achievement) { achievement_ = std::move(achievement); }

 private:
  Ref<Object> achievement_;
};

// A badge with a text of one or more lines below it; a tap opens the achievement.
class CHAchievementsCellContentView : public View {
 public:
  static Class& staticClass();

  const Ref<Label>& label() const { return label_; }
  const Ref<ODUIBadgeView>& badgeView() const { return badgeView_; }
  void layoutSubviews() override;

 private:
  Ref<Label> label_;
  Ref<ODUIBadgeView> badgeView_;
};

}  // namespace ax::host
