#include "host/workouts/CHWorkoutDetailTwoValueTableViewCell.h"

#include "host/core/Layout.h"
#include "host/workouts/CHWorkoutFormattingManager.h"
#include "host/workouts/WorkoutFigures.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

const Message<void(Ref<Object>, Ref<Object>)> configure1{"configureWithTitle1:value1:"};
const Message<void(Ref<Object>, Ref<Object>)> configure2{"configureWithTitle2:value2:"};

Ref<Object> asFigure(const Ref<Object>& value) {
  if (const Ref<Workout> workout = cast<Workout>(value)) return formattedDuration(workout, "detail");
  if (const Ref<Date> date = cast<Date>(value)) return dateStringForFormat(date, "EEEEMMMMdyjm");
  if (!value || cast<Quantity>(value.get()) != nullptr) return figureOf(cast<Quantity>(value));
  return value;
}

void show(Label& label, const Ref<Object>& content) {
  if (const Ref<AttributedString> styled = cast<AttributedString>(content)) {
    label.setAttributedText(styled);
  } else {
    label.setText(cast<String>(content));
  }
}

}  // namespace

Class& CHWorkoutDetailTwoValueTableViewCell::staticClass() {
  using T = CHWorkoutDetailTwoValueTableViewCell;
  static Class& result = ClassBuilder<T>("CHWorkoutDetailTwoValueTableViewCell", TableViewCell::staticClass())
                             .instanceVariable<&T::titleLabel1_>("_titleLabel1")
                             .instanceVariable<&T::titleLabel2_>("_titleLabel2")
                             .instanceVariable<&T::valueLabel1_>("_valueLabel1")
                             .instanceVariable<&T::valueLabel2_>("_valueLabel2")
                             .property<&T::title1, &T::setTitle1>("title1")
                             .property<&T::title2, &T::setTitle2>("title2")
                             .property<&T::value1, &T::setValue1>("value1")
                             .property<&T::value2, &T::setValue2>("value2")
                             .method<&T::configureWithTitle1Value1>("configureWithTitle1:value1:")
                             .method<&T::configureWithTitle2Value2>("configureWithTitle2:value2:")
                             .build();
  return result;
}

void CHWorkoutDetailTwoValueTableViewCell::setValue1(Ref<Object> value) {
  value1_ = std::move(value);
  configure1(*this, title1_, asFigure(value1_));
}

void CHWorkoutDetailTwoValueTableViewCell::setValue2(Ref<Object> value) {
  value2_ = std::move(value);
  configure2(*this, title2_, asFigure(value2_));
}

void CHWorkoutDetailTwoValueTableViewCell::configureWithTitle1Value1(Ref<Object> title, Ref<Object> value) {
  show(ensure(titleLabel1_), title);
  show(ensure(valueLabel1_), value);
  layoutSubviews();
}

void CHWorkoutDetailTwoValueTableViewCell::configureWithTitle2Value2(Ref<Object> title, Ref<Object> value) {
  show(ensure(titleLabel2_), title);
  show(ensure(valueLabel2_), value);
  layoutSubviews();
}

void CHWorkoutDetailTwoValueTableViewCell::layoutSubviews() {
  const double column = frame().width / 2;
  const double row = frame().height / 2;
  View& content = *contentView();
  showIn(content, titleLabel1_, {0, 0, column, row});
  showIn(content, valueLabel1_, {0, row, column, row});
  showIn(content, titleLabel2_, {column, 0, column, row});
  showIn(content, valueLabel2_, {column, row, column, row});
}

static const RegisteredClass<CHWorkoutDetailTwoValueTableViewCell> registered;

}  // namespace ax::host
