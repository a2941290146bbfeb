#pragma once

#include "platform/runtime/Number.h"
#include "platform/toolkit/View.h"

namespace ax::host {

// A chart of the app's chart library: it draws its points into a container view, between two ends of the
// vertical axis.
class VLUIChartView : public View {
 public:
  static Class& staticClass();

  void setRange(Ref<Number> minYValue, Ref<Number> maxYValue);
  // Lays the container, made when there is none, over the whole view.
  void layoutSubviews() override;

 private:
  Ref<View> containerView_;
  Ref<Number> minYValue_;
  Ref<Number> maxYValue_;
};

}  // namespace ax::host
