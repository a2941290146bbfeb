#include "host/workouts/CHWorkoutSummaryTabbedLabelContainer.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHWorkoutSummaryTabbedLabelContainer::staticClass() {
  using T = CHWorkoutSummaryTabbedLabelContainer;
  static Class& result = ClassBuilder<T>("_CHWorkoutSummaryTabbedLabelContainer", View::staticClass())
                             .instanceVariable<&T::titleText_>("_titleText")
                             .instanceVariable<&T::totalText_>("_totalText")
                             .instanceVariable<&T::averageText_>("_averageText")
                             .build();
  return result;
}

void CHWorkoutSummaryTabbedLabelContainer::show(Ref<String> title, Ref<String> total, Ref<String> average) {
  titleText_ = std::move(title);
  totalText_ = std::move(total);
  averageText_ = std::move(average);
  layoutSubviews();
}

void CHWorkoutSummaryTabbedLabelContainer::layoutSubviews() {
  ensure(titleLabel_).setText(titleText_);
  ensure(figureLabel_).setText(isEmpty(totalText_) ? averageText_ : totalText_);
  const double half = frame().height / 2;
  showIn(*this, titleLabel_, {0, 0, frame().width, half});
  showIn(*this, figureLabel_, {0, half, frame().width, half});
}

static const RegisteredClass<CHWorkoutSummaryTabbedLabelContainer> registered;

}  // namespace ax::host
