#pragma once

#include "platform/toolkit/Label.h"

namespace ax::host {

// The title over a month: the month's number. "_VeltoMonthTitleLabel".
class VeltoMonthTitleLabel : public Label {
 public:
  static Class& staticClass();
};

// A week of a calendar; the first one of a month has a title.
class QSCalendarWeekView : public View {
 public:
  static Class& staticClass();

  const Ref<View>& monthTitleView() const { return monthTitleView_; }
  void setMonthTitleView(Ref<View> view) { monthTitleView_ = std::move(view); }
  void layoutSubviews() override;

 private:
  Ref<View> monthTitleView_;
};

// A week of the month screen. Its days are sublayers of its own layer; days without a frame are put into
// columns. The goal texts show below a line that appears while the user drags.
class MonthWeekView : public QSCalendarWeekView {
 public:
  static Class& staticClass();

  void layoutSubviews() override;

 private:
  void layOutDays();

  Ref<Label> goalTextLabel_;
  Ref<Label> goalPercentChangeTextLabel_;
  Ref<Layer> topBorderLineOnDrag_;
};

}  // namespace ax::host
