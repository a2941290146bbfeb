#include "host/workouts/CHWorkoutSummaryTableViewCell.h"

#include "host/core/Layout.h"
#include "host/workouts/WorkoutFigures.h"
#include "host/workouts/WorkoutTotals.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

const Message<void()> updateUI{"_updateUI"};

}  // namespace

Class& CHWorkoutSummaryTableViewCell::staticClass() {
  using T = CHWorkoutSummaryTableViewCell;
  static Class& result = ClassBuilder<T>("CHWorkoutSummaryTableViewCell", TableViewCell::staticClass())
                             .instanceVariable<&T::titleLabel_>("_titleLabel")
                             .instanceVariable<&T::durationLabel_>("_durationLabel")
                             .instanceVariable<&T::distanceLabel_>("_distanceLabel")
                             .instanceVariable<&T::activeEnergyLabel_>("_activeEnergyLabel")
                             .property<&T::workouts, &T::setWorkouts>("workouts")
                             .method<&T::_updateUI>("_updateUI")
                             .build();
  return result;
}

void CHWorkoutSummaryTableViewCell::setWorkouts(Ref<Array> workouts) {
  workouts_ = std::move(workouts);
  updateUI(*this);
}

void CHWorkoutSummaryTableViewCell::_updateUI() {
  const Ref<Workout> first = cast<Workout>(workouts_ ? workouts_->firstObject() : nullptr);
  const WorkoutTotals totals(workouts_);
  ensure(titleLabel_).setText(first ? titleOf(*first) : nullptr);
  showDuration(ensure(durationLabel_), totals.seconds, totals.count);
  showFigure(ensure(distanceLabel_), "figure.distance", totals.distance);
  showFigure(ensure(activeEnergyLabel_), "figure.active.calories", totals.energy);
  layoutSubviews();
}

void CHWorkoutSummaryTableViewCell::layoutSubviews() {
  stackIn(*this, {titleLabel_, durationLabel_, distanceLabel_, activeEnergyLabel_});
}

static const RegisteredClass<CHWorkoutSummaryTableViewCell> registered;

}  // namespace ax::host
