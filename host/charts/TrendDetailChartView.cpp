#include "host/charts/TrendDetailChartView.h"

#include "host/charts/TrendStops.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& TrendBar::staticClass() {
  static Class& result = ClassBuilder<TrendBar>("Velto.TrendBar", Object::staticClass())
                             .instanceVariable<&TrendBar::dateInterval_>("dateInterval")
                             .instanceVariable<&TrendBar::quantity_>("quantity")
                             .build();
  return result;
}

Class& TrendDetailChartView::staticClass() {
  using T = TrendDetailChartView;
  static Class& result =
      ClassBuilder<T>("Velto.TrendDetailChartView", View::staticClass())
          .property<&T::titleLabel, &T::setTitleLabel>("titleLabel")
          .property<&T::chartMaxLabel, &T::setChartMaxLabel>("chartMaxLabel")
          .property<&T::accessibilityUnit, &T::setAccessibilityUnit>("accessibilityUnit")
          .property<&T::barStops, &T::setBarStops>("barStops")
          .instanceVariable<&T::bars_>("bars")
          .method<&T::accessibilityQuantityForIndex>("accessibilityQuantityForIndex:")
          .method<&T::accessibilityDateIntervalForIndex>("accessibilityDateIntervalForIndex:")
          .build();
  return result;
}

const TrendBar& TrendDetailChartView::barAt(std::int32_t index) const {
  return itemAt<TrendBar>(bars_, index);
}

void TrendDetailChartView::layoutSubviews() {
  const std::initializer_list<Ref<View>> parts = {titleLabel_, chartMaxLabel_};
  for (const Ref<View>& part : parts) {
    if (part && part->superview() == nullptr) addSubview(part);
  }
  if (!barStops_ && bars_) barStops_ = evenStops(bars_->count(), frame().width);
}

static const RegisteredClass<TrendBar> registeredBar;
static const RegisteredClass<TrendDetailChartView> registered;

}  // namespace ax::host
