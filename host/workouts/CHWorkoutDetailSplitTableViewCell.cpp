#include "host/workouts/CHWorkoutDetailSplitTableViewCell.h"

#include "host/workouts/CHWorkoutDataCalculator.h"
#include "host/workouts/Placement.h"
#include "host/workouts/WorkoutFigures.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

bool isWholeUnit(const Ref<Quantity>& distance) {
  const Ref<Unit> unit = CHWorkoutDataCalculator::unitOf(distance);
  return formatFloat(1, static_cast<float>(distance->doubleValueForUnit(unit)))->isEqual(*formatInteger(1));
}

}  // namespace

Class& CHWorkoutSplit::staticClass() {
  using T = CHWorkoutSplit;
  static Class& result = ClassBuilder<T>("CHWorkoutSplit", Object::staticClass())
                             .instanceVariable<&T::index_>("index")
                             .instanceVariable<&T::distance_>("distance")
                             .instanceVariable<&T::duration_>("duration")
                             .build();
  return result;
}

Class& CHWorkoutDetailSplitTableViewCell::staticClass() {
  using T = CHWorkoutDetailSplitTableViewCell;
  static Class& result =
      ClassBuilder<T>("CHWorkoutDetailSplitTableViewCell", CHWorkoutDetailPaceTableViewCell::staticClass())
          .property<&T::split, &T::setSplit>("split")
          .build();
  return result;
}

void CHWorkoutDetailSplitTableViewCell::setSplit(Ref<CHWorkoutSplit> split) {
  split_ = std::move(split);
  if (!split_) return;
  const Ref<Quantity>& distance = split_->distance();
  const double pace = CHWorkoutDataCalculator::pace(distance, split_->duration());
  ensure(unitLabel_).setText(hostText("split.number", {formatInteger(split_->index())}));
  ensure(distanceLabel_).setText(distanceInWords(distance));
  distanceLabel_->setHidden(!distance || isWholeUnit(distance));
  ensure(paceLabel_).setAttributedText(paceFigure(pace, *CHWorkoutDataCalculator::unitOf(distance)));
  layoutSubviews();
}

void CHWorkoutDetailSplitTableViewCell::layoutSubviews() {
  const double column = frame().width / 3;
  showIn(*contentView(), unitLabel_, {0, 0, column, frame().height});
  showIn(*contentView(), distanceLabel_, {column, 0, column, frame().height});
  showIn(*contentView(), paceLabel_, {2 * column, 0, column, frame().height});
}

static const RegisteredClass<CHWorkoutSplit> registeredSplit;
static const RegisteredClass<CHWorkoutDetailSplitTableViewCell> registered;

}  // namespace ax::host
