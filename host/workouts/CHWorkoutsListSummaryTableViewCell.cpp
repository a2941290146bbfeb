#include "host/workouts/CHWorkoutsListSummaryTableViewCell.h"

#include "host/core/Layout.h"
#include "host/workouts/WorkoutFigures.h"
#include "host/workouts/WorkoutTotals.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHWorkoutsListSummaryTableViewCell::staticClass() {
  using T = CHWorkoutsListSummaryTableViewCell;
  static Class& result = ClassBuilder<T>("CHWorkoutsListSummaryTableViewCell", TableViewCell::staticClass())
                             .instanceVariable<&T::numberOfWorkoutsLabel_>("_numberOfWorkoutsLabel")
                             .instanceVariable<&T::activeEnergyLabel_>("_activeEnergyLabel")
                             .instanceVariable<&T::durationLabel_>("_durationLabel")
                             .instanceVariable<&T::distanceLabel_>("_distanceLabel")
                             .instanceVariable<&T::paceLabel_>("_paceLabel")
                             .property<&T::workouts, &T::setWorkouts>("workouts")
                             .build();
  return result;
}

void CHWorkoutsListSummaryTableViewCell::setWorkouts(Ref<Array> workouts) {
  workouts_ = std::move(workouts);
  const WorkoutTotals totals(workouts_);
  ensure(numberOfWorkoutsLabel_)
      .show(hostText("figure.workouts"), formatInteger(static_cast<std::int64_t>(totals.count)), nullptr);
  showFigure(ensure(activeEnergyLabel_), "figure.active.calories", totals.energy);
  showDuration(ensure(durationLabel_), totals.seconds, totals.count);
  showFigure(ensure(distanceLabel_), "figure.distance", totals.distance);
  showPace(ensure(paceLabel_), totals);
  layoutSubviews();
}

void CHWorkoutsListSummaryTableViewCell::layoutSubviews() {
  stackIn(*this, {numberOfWorkoutsLabel_, durationLabel_, activeEnergyLabel_, distanceLabel_, paceLabel_});
}

static const RegisteredClass<CHWorkoutsListSummaryTableViewCell> registered;

}  // namespace ax::host
