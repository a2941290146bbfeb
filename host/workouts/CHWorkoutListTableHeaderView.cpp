#include "host/workouts/CHWorkoutListTableHeaderView.h"

#include "host/core/Layout.h"
#include "host/workouts/WorkoutFigures.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHWorkoutListTableHeaderView::staticClass() {
  using T = CHWorkoutListTableHeaderView;
  static Class& result = ClassBuilder<T>("CHWorkoutListTableHeaderView", View::staticClass())
                             .instanceVariable<&T::dateLabel_>("_dateLabel")
                             .instanceVariable<&T::detailLabel_>("_detailLabel")
                             .property<&T::month, &T::setMonth>("month")
                             .property<&T::numberOfWorkouts, &T::setNumberOfWorkouts>("numberOfWorkouts")
                             .build();
  return result;
}

void CHWorkoutListTableHeaderView::setMonth(Ref<Date> month) {
  month_ = std::move(month);
  ensure(dateLabel_).setText(dateStringForFormat(month_, "MMMMy"));
}

void CHWorkoutListTableHeaderView::setNumberOfWorkouts(std::int64_t workouts) {
  numberOfWorkouts_ = workouts;
  ensure(detailLabel_).setText(hostText("workouts.count", {number(workouts)}));
}

void CHWorkoutListTableHeaderView::layoutSubviews() {
  const double half = frame().width / 2;
  showIn(*this, dateLabel_, {0, 0, half, frame().height});
  showIn(*this, detailLabel_, {half, 0, half, frame().height});
}

static const RegisteredClass<CHWorkoutListTableHeaderView> registered;

}  // namespace ax::host
