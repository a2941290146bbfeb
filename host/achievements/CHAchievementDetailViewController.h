#pragma once

#include "host/achievements/ODUIBadgeView.h"
#include "host/core/AchievementLibrary.h"
#include "platform/toolkit/Label.h"
#include "platform/toolkit/ViewController.h"

namespace ax::host {

// The screen of one achievement: its badge, in a container that it turns in, and a text below.
class CHAchievementDetailViewController : public ViewController {
 public:
  static Class& staticClass();

  const Ref<Label>& label() const { return label_; }
  void setLabel(Ref<Label> label) { label_ = std::move(label); }
  const Ref<View>& badgeContainer() const { return badgeContainer_; }
  void setBadgeContainer(Ref<View> container) { badgeContainer_ = std::move(container); }

  // Puts the badge into its container, and container and text onto the screen.
  void viewDidLoad() override;

 private:
  Ref<ACHAchievement> achievement_;
  Ref<ODUIAchievementLocalizationProvider> locProvider_;
  Ref<ODUIBadgeView> badgeView_;
  Ref<Label> label_;
  Ref<View> badgeContainer_;
};

}  // namespace ax::host
