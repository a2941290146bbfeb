#include "host/trends/TrendListMetricView.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& TrendListMetricView::staticClass() {
  using T = TrendListMetricView;
  static Class& result = ClassBuilder<T>("Velto.TrendListMetricView", View::staticClass())
                             .property<&T::titleLabel, &T::setTitleLabel>("titleLabel")
                             .property<&T::valueLabel, &T::setValueLabel>("valueLabel")
                             .property<&T::trendString, &T::setTrendString>("trendString")
                             .build();
  return result;
}

void TrendListMetricView::layoutSubviews() {
  const double height = frame().height / 2;
  addUnplaced(*this, titleLabel_, {0, 0, frame().width, height});
  addUnplaced(*this, valueLabel_, {0, height, frame().width, height});
}

static const RegisteredClass<TrendListMetricView> registered;

}  // namespace ax::host
