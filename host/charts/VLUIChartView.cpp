#include "host/charts/VLUIChartView.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& VLUIChartView::staticClass() {
  using T = VLUIChartView;
  static Class& result = ClassBuilder<T>("VLUIChartView", View::staticClass())
                             .instanceVariable<&T::containerView_>("_containerView")
                             .instanceVariable<&T::minYValue_>("minYValue")
                             .instanceVariable<&T::maxYValue_>("maxYValue")
                             .build();
  return result;
}

void VLUIChartView::setRange(Ref<Number> minYValue, Ref<Number> maxYValue) {
  minYValue_ = std::move(minYValue);
  maxYValue_ = std::move(maxYValue);
}

void VLUIChartView::layoutSubviews() {
  if (!containerView_) containerView_ = make<View>();
  if (containerView_->superview() == nullptr) addSubview(containerView_);
  if (containerView_->frame() == Rect()) containerView_->setFrame(bounds());
}

static const RegisteredClass<VLUIChartView> registered;

}  // namespace ax::host
