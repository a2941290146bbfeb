#include "host/calendar/ActivityTappableDay.h"

#include "platform/foundation/Formatters.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& ActivityTappableDay::staticClass() {
  using T = ActivityTappableDay;
  static Class& result = ClassBuilder<T>("ActivityTappableDay", Control::staticClass())
                             .property<&T::date, &T::setDate>("date")
                             .build();
  return result;
}

Ref<String> ActivityTappableDay::defaultLabel() {
  return dateStringForFormat(date_, "d");
}

Class& WeekPaletteTappableDay::staticClass() {
  using T = WeekPaletteTappableDay;
  static Class& result = ClassBuilder<T>("WeekPaletteTappableDay", ActivityTappableDay::staticClass())
                             .instanceVariable<&T::circle_>("_circle")
                             .build();
  return result;
}

void WeekPaletteTappableDay::layoutSubviews() {
  layer()->addSublayer(circle_);
}

static const RegisteredClass<ActivityTappableDay> registered;
static const RegisteredClass<WeekPaletteTappableDay> registeredInPalette;

}  // namespace ax::host
