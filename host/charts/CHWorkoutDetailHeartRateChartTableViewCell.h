#pragma once

#include "host/charts/CHWorkoutDetailHeartRateChartView.h"
#include "platform/toolkit/Control.h"
#include "platform/toolkit/ScrollView.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// The row of a workout's heart rate: pages of charts side by side, with a page control under them. When the
// chart has too little to show, an overlay over the row says so and leads to an explanation.
class CHWorkoutDetailHeartRateChartTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  void layoutSubviews() override;

 private:
  void _createAndConstraintNoDataOverlay();
  void overlayButtonTapped(Ref<Object> sender);

  Ref<View> noDataOverlayView_;
  Ref<ScrollView> scrollView_;
  Ref<PageControl> pageControl_;
  Ref<CHWorkoutDetailHeartRateChartView> chartView_;
  bool showsExplanation_ = false;
};

}  // namespace ax::host
