#include "host/achievements/CHAchievementsSectionHeaderView.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHAchievementsSectionHeaderView::staticClass() {
  using T = CHAchievementsSectionHeaderView;
  static Class& result = ClassBuilder<T>("CHAchievementsSectionHeaderView", View::staticClass())
                             .property<&T::label, &T::setLabel>("label")
                             .build();
  return result;
}

void CHAchievementsSectionHeaderView::layoutSubviews() {
  addUnplaced(*this, {label_});
}

static const RegisteredClass<CHAchievementsSectionHeaderView> registered;

}  // namespace ax::host
