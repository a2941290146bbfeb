#pragma once

#include "host/charts/ActivityMoveAndExerciseChartView.h"
#include "host/charts/DayViewTitleAndValueLabelPair.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// The day's row with the move or exercise chart: "Velto.DayViewMoveAndExerciseChartTableViewCell".
class DayViewMoveAndExerciseChartTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  const Ref<DayViewTitleAndValueLabelPair>& labelPair() const { return labelPair_; }
  void setLabelPair(Ref<DayViewTitleAndValueLabelPair> pair) { labelPair_ = std::move(pair); }
  const Ref<ActivityMoveAndExerciseChartView>& chartView() const { return chartView_; }
  void setChartView(Ref<ActivityMoveAndExerciseChartView> view) { chartView_ = std::move(view); }
  // What stands below the chart, such as the day's total.
  const Ref<Label>& auxiliaryLabel() const { return auxiliaryLabel_; }
  void setAuxiliaryLabel(Ref<Label> label) { auxiliaryLabel_ = std::move(label); }

  void layoutSubviews() override;

 private:
  Ref<DayViewTitleAndValueLabelPair> labelPair_;
  Ref<ActivityMoveAndExerciseChartView> chartView_;
  Ref<Label> auxiliaryLabel_;
};

}  // namespace ax::host
