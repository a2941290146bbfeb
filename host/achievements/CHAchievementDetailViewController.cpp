#include "host/achievements/CHAchievementDetailViewController.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHAchievementDetailViewController::staticClass() {
  using T = CHAchievementDetailViewController;
  static Class& result = ClassBuilder<T>("CHAchievementDetailViewController", ViewController::staticClass())
                             .instanceVariable<&T::achievement_>("_achievement")
                             .instanceVariable<&T::locProvider_>("_locProvider")
                             .instanceVariable<&T::badgeView_>("_badgeView")
                             .property<&T::label, &T::setLabel>("label")
                             .property<&T::badgeContainer, &T::setBadgeContainer>("badgeContainer")
                             .build();
  return result;
}

void CHAchievementDetailViewController::viewDidLoad() {
  if (badgeContainer_) addUnplaced(*badgeContainer_, {badgeView_});
  addUnplaced(*view(), {badgeContainer_, label_});
}

static const RegisteredClass<CHAchievementDetailViewController> registered;

}  // namespace ax::host
