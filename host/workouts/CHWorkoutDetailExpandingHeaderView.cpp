#include "host/workouts/CHWorkoutDetailExpandingHeaderView.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHWorkoutDetailExpandingHeaderView::staticClass() {
  using T = CHWorkoutDetailExpandingHeaderView;
  static Class& result = ClassBuilder<T>("CHWorkoutDetailExpandingHeaderView", View::staticClass())
                             .instanceVariable<&T::titleLabel_>("_titleLabel")
                             .instanceVariable<&T::expandButton_>("_expandButton")
                             .instanceVariable<&T::expanded_>("_expanded")
                             .method<&T::_expandButtonTapped>("_expandButtonTapped:")
                             .build();
  return result;
}

void CHWorkoutDetailExpandingHeaderView::layoutSubviews() {
  const double height = frame().height;
  showIn(*this, titleLabel_, {0, 0, frame().width - height, height});
  showIn(*this, expandButton_, {frame().width - height, 0, height, height});
  if (expandButton_ && !expandButton_->action()) {
    expandButton_->setTargetAction(Ref<Object>(this), Selector::intern("_expandButtonTapped:"));
  }
}

bool CHWorkoutDetailExpandingHeaderView::activateByDefault() {
  return messages::accessibilityActivate(expandButton_);
}

void CHWorkoutDetailExpandingHeaderView::_expandButtonTapped(Ref<Object>) {
  expanded_ = !expanded_;
}

static const RegisteredClass<CHWorkoutDetailExpandingHeaderView> registered;

}  // namespace ax::host
