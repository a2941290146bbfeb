#include "host/workouts/CHWorkoutDetailSplitTableViewCell.h"

#include "host/core/Layout.h"
#include "host/workouts/CHWorkoutDataCalculator.h"
#include "host/workouts/WorkoutFigures.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

bool isWholeUnit(const Ref<Quantity>& distance) {
  const Ref<Unit> unit = CHWorkoutDataCalculator::unitOf(distance);
  return formatFloat(FloatFormat::twoDecimals, static_cast<float>(distance->doubleValueForUnit(unit)))
      ->isEqual(*formatInteger(1));
}

// Who rests in a pool swims no length then, and counts none.
Ref<String> nameOf(const CHWorkoutSplit& split) {
  if (split.isRest() && split.isLength()) return hostText("split.rest.between.lengths");
  const Ref<String> name =
      hostText(split.isLength() ? "split.length" : "split.number", {formatInteger(split.index())});
  if (split.isRest()) return hostText("split.rest", {name});
  return split.stroke() ? hostText("split.stroke", {name, split.stroke()}) : name;
}

Ref<AttributedString> paceOf(const CHWorkoutSplit& split) {
  const Ref<Quantity>& distance = split.distance();
  if (!distance && split.duration() > 0) return clockFigure(split.duration());
  const bool isRide = split.activityType() == WorkoutActivityTypeCycling;
  if (isRide) return figureOf(CHWorkoutDataCalculator::speed(distance, split.duration()));
  const double pace = CHWorkoutDataCalculator::pace(distance, split.duration());
  const ShownPace shown = CHWorkoutDataCalculator::shownPace(pace, distance, split.activityType());
  return paceFigure(shown.seconds, *shown.unit);
}

}  // namespace

Class& CHWorkoutSplit::staticClass() {
  using T = CHWorkoutSplit;
  static Class& result = ClassBuilder<T>("CHWorkoutSplit", Object::staticClass())
                             .instanceVariable<&T::index_>("index")
                             .instanceVariable<&T::distance_>("distance")
                             .instanceVariable<&T::duration_>("duration")
                             .instanceVariable<&T::activityType_>("activityType")
                             .instanceVariable<&T::isRest_>("isRest")
                             .instanceVariable<&T::isLength_>("isLength")
                             .instanceVariable<&T::stroke_>("stroke")
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
  ensure(unitLabel_).setText(nameOf(*split_));
  ensure(distanceLabel_).setText(distanceInWords(distance));
  distanceLabel_->setHidden(!distance || isWholeUnit(distance));
  ensure(paceLabel_).setAttributedText(paceOf(*split_));
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
