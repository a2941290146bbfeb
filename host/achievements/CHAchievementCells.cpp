#include "host/achievements/CHAchievementCells.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHAchievementCollectionViewCell::staticClass() {
  using T = CHAchievementCollectionViewCell;
  static Class& result = ClassBuilder<T>("CHAchievementCollectionViewCell", CollectionViewCell::staticClass())
                             .property<&T::achievement, &T::setAchievement>("achievement")
                             .build();
  return result;
}

Class& CHAchievementsCellContentView::staticClass() {
  using T = CHAchievementsCellContentView;
  static Class& result = ClassBuilder<T>("CHAchievementsCellContentView", View::staticClass())
                             .instanceVariable<&T::label_>("_label")
                             .instanceVariable<&T::badgeView_>("_badgeView")
                             .method<&T::label>("label")
                             .method<&T::badgeView>("badgeView")
                             .build();
  return result;
}

void CHAchievementsCellContentView::layoutSubviews() {
  addUnplaced(*this, {badgeView_, label_});
}

static const RegisteredClass<CHAchievementCollectionViewCell> registered;
static const RegisteredClass<CHAchievementsCellContentView> registeredContentView;

}  // namespace ax::host
