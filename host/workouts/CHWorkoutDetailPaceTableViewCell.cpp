#include "host/workouts/CHWorkoutDetailPaceTableViewCell.h"

#include "host/core/Layout.h"
#include "host/workouts/CHWorkoutDataCalculator.h"
#include "host/workouts/WorkoutFigures.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

const Message<void(Ref<Object>, Ref<Object>)> configure{"configureWithWorkout:dataCalculator:"};
const Message<double(Ref<Object>)> paceForWorkout{"paceForWorkout:"};
const Message<Ref<Object>(Ref<Object>)> speedForWorkout{"speedForWorkout:"};

}  // namespace

Class& CHWorkoutDetailPaceTableViewCell::staticClass() {
  using T = CHWorkoutDetailPaceTableViewCell;
  static Class& result =
      ClassBuilder<T>("CHWorkoutDetailPaceTableViewCell", TableViewCell::staticClass())
          .instanceVariable<&T::titleLabel_>("_titleLabel")
          .instanceVariable<&T::valueLabel_>("_valueLabel")
          .instanceVariable<&T::unitLabel_>("_unitLabel")
          .instanceVariable<&T::distanceLabel_>("_distanceLabel")
          .instanceVariable<&T::paceLabel_>("_paceLabel")
          .property<&T::workout, &T::setWorkout>("workout")
          .method<&T::configureWithWorkoutDataCalculator>("configureWithWorkout:dataCalculator:")
          .build();
  return result;
}

void CHWorkoutDetailPaceTableViewCell::setWorkout(Ref<Workout> workout) {
  workout_ = std::move(workout);
  configure(*this, workout_, make<CHWorkoutDataCalculator>());
}

void CHWorkoutDetailPaceTableViewCell::configureWithWorkoutDataCalculator(Ref<Workout> workout,
                                                                          Ref<Object> calculator) {
  const bool isRide = workout && workout->workoutActivityType() == WorkoutActivityTypeCycling;
  ensure(titleLabel_).setText(hostText(isRide ? "figure.average.speed" : "figure.average.pace"));
  if (isRide) {
    ensure(valueLabel_).setAttributedText(figureOf(cast<Quantity>(speedForWorkout(calculator, workout))));
  } else {
    const ShownPace pace = CHWorkoutDataCalculator::shownPace(paceForWorkout(calculator, workout),
                                                              workout ? workout->totalDistance() : nullptr,
                                                              workout ? workout->workoutActivityType() : 0);
    ensure(valueLabel_).setAttributedText(paceFigure(pace.seconds, *pace.unit));
  }
  layoutSubviews();
}

void CHWorkoutDetailPaceTableViewCell::layoutSubviews() {
  stackIn(*this, {titleLabel_, valueLabel_});
}

static const RegisteredClass<CHWorkoutDetailPaceTableViewCell> registered;

}  // namespace ax::host
