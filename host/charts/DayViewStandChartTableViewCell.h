#pragma once

#include "host/charts/ActivityStandChartView.h"
#include "host/charts/DayViewTitleAndValueLabelPair.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// The day's row with the stand chart: "Velto.DayViewStandChartTableViewCell".
class DayViewStandChartTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  const Ref<ActivityStandChartView>& chartView() const { return chartView_; }
  void setChartView(Ref<ActivityStandChartView> view) { chartView_ = std::move(view); }
  const Ref<Label>& idleHoursLabel() const { return idleHoursLabel_; }
  void setIdleHoursLabel(Ref<Label> label) { idleHoursLabel_ = std::move(label); }

  void layoutSubviews() override;

 private:
  Ref<DayViewTitleAndValueLabelPair> titleAndValue_;
  Ref<ActivityStandChartView> chartView_;
  Ref<Label> idleHoursLabel_;
};

}  // namespace ax::host
