#include "host/workouts/CHWorkoutsListTableViewCell.h"

#include "host/core/Layout.h"
#include "host/workouts/CHWorkoutFormattingManager.h"
#include "host/workouts/WorkoutFigures.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

const Message<void()> configureWithCurrentWorkout{"_configureWithCurrentWorkout"};

Ref<Image> iconOf(const Workout& workout) {
  const Ref<Source> source = workout.sourceRevision() ? workout.sourceRevision()->source() : nullptr;
  if (!source || source->_isNorvaleWatch()) return nullptr;
  const Ref<Image> icon = make<Image>();
  icon->setName(source->name());
  return icon;
}

Ref<String> shortDate(const Ref<Date>& date) {
  const Ref<DateFormatter> formatter = make<DateFormatter>();
  formatter->setDateStyle(DateFormatterStyle::medium);
  return formatter->stringFromDate(date);
}

}  // namespace

Class& CHWorkoutsListTableViewCell::staticClass() {
  using T = CHWorkoutsListTableViewCell;
  static Class& result = ClassBuilder<T>("CHWorkoutsListTableViewCell", TableViewCell::staticClass())
                             .instanceVariable<&T::workout_>("_workout")
                             .instanceVariable<&T::titleLabel_>("_titleLabel")
                             .instanceVariable<&T::durationLabel_>("_durationLabel")
                             .instanceVariable<&T::distanceLabel_>("_distanceLabel")
                             .instanceVariable<&T::dateLabel_>("_dateLabel")
                             .property<&T::workout, &T::setWorkout>("workout")
                             .method<&T::_configureWithCurrentWorkout>("_configureWithCurrentWorkout")
                             .build();
  return result;
}

void CHWorkoutsListTableViewCell::setWorkout(Ref<Workout> workout) {
  workout_ = std::move(workout);
  configureWithCurrentWorkout(*this);
}

void CHWorkoutsListTableViewCell::_configureWithCurrentWorkout() {
  if (!imageView()) setImageView(make<ImageView>());
  imageView()->setImage(workout_ ? iconOf(*workout_) : nullptr);
  showFigures();
  ensure(dateLabel_).setText(workout_ ? shortDate(workout_->startDate()) : nullptr);
  layoutSubviews();
}

void CHWorkoutsListTableViewCell::showFigures() {
  const bool hasDistance = workout_ && workout_->totalDistance();
  ensure(titleLabel_).setText(workout_ ? titleOf(*workout_) : nullptr);
  ensure(durationLabel_).setAttributedText(formattedDuration(workout_, "list"));
  ensure(distanceLabel_).setAttributedText(hasDistance ? figureOf(workout_->totalDistance()) : nullptr);
  distanceLabel_->setHidden(!hasDistance);
}

void CHWorkoutsListTableViewCell::layoutSubviews() {
  const Rect whole = frame();
  const double column = std::max(0.0, whole.width - 60) / 2;
  View& content = *contentView();
  showIn(content, imageView(), {8, 8, 44, 44});
  showIn(content, titleLabel_, {60, 4, column, 20});
  showIn(content, durationLabel_, {60, 24, column, 18});
  showIn(content, distanceLabel_, {60, 42, column, 18});
  showIn(content, dateLabel_, {60 + column, 4, column, 20});
}

static const RegisteredClass<CHWorkoutsListTableViewCell> registered;

}  // namespace ax::host
