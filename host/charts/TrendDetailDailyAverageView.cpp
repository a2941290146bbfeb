#include "host/charts/TrendDetailDailyAverageView.h"

#include "host/charts/TrendStops.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& TrendDayAverage::staticClass() {
  using T = TrendDayAverage;
  static Class& result = ClassBuilder<T>("Velto.TrendDayAverage", Object::staticClass())
                             .instanceVariable<&T::weekday_>("weekday")
                             .instanceVariable<&T::average365_>("average365")
                             .instanceVariable<&T::average90_>("average90")
                             .build();
  return result;
}

Class& TrendDetailDailyAverageView::staticClass() {
  using T = TrendDetailDailyAverageView;
  static Class& result = ClassBuilder<T>("Velto.TrendDetailDailyAverageView", View::staticClass())
                             .property<&T::titleLabel, &T::setTitleLabel>("titleLabel")
                             .property<&T::accessibilityUnit, &T::setAccessibilityUnit>("accessibilityUnit")
                             .property<&T::dayStops, &T::setDayStops>("dayStops")
                             .instanceVariable<&T::days_>("days")
                             .method<&T::quantity365ForIndex>("accessibiliytQuantity365ForIndex:")
                             .method<&T::quantity90ForIndex>("accessibiliytQuantity90ForIndex:")
                             .method<&T::accessibilityDayForStopIndex>("accessibilityDayForStopIndex:")
                             .build();
  return result;
}

const TrendDayAverage& TrendDetailDailyAverageView::dayAt(std::int32_t index) const {
  return itemAt<TrendDayAverage>(days_, index);
}

void TrendDetailDailyAverageView::layoutSubviews() {
  if (titleLabel_ && titleLabel_->superview() == nullptr) addSubview(titleLabel_);
  if (!dayStops_ && days_) dayStops_ = evenStops(days_->count(), frame().width);
}

static const RegisteredClass<TrendDayAverage> registeredDay;
static const RegisteredClass<TrendDetailDailyAverageView> registered;

}  // namespace ax::host
