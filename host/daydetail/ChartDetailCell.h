#pragma once

#include "platform/health/Quantity.h"
#include "platform/toolkit/Control.h"
#include "platform/toolkit/Label.h"
#include "platform/toolkit/ScrollView.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// A ring's chart on a day's page: a scroll view with the chart, page by page, a line with the figure that
// reaches over its top, and a page control.
class ChartDetailCell : public TableViewCell {
 public:
  static Class& staticClass();

  // The unit beside the chart; nil until one is added.
  const Ref<Label>& chartLabel() const { return chartLabel_; }
  // Puts a new label with the unit's name in place of the former one.
  void addChartLabelWithUnit(Ref<Object> unit);
  void layoutSubviews() override;

 protected:
  // Tells the cell the day's figures that it was given as members.
  virtual void configure() {}
  // Shows "29/30 min" and how far the ring is closed.
  void showFigure(double amount, double goal, std::string_view unitKey, double percent);
  double percent() const { return percent_; }

 private:
  Ref<Label> chartLabel_;
  Ref<Label> value_;
  Ref<ScrollView> scrollview_;
  Ref<PageControl> pageControl_;
  Ref<Unit> unit_;
  double percent_ = 0;
  bool isConfigured_ = false;
};

class MoveChartDetailCell : public ChartDetailCell {
 public:
  static Class& staticClass();

  // Either quantity may be nil, for nothing yet.
  void setActiveEnergyGoalEnergyPercent(Ref<Quantity> activeEnergy, Ref<Quantity> goalEnergy, double percent);

 protected:
  void configure() override;

 private:
  Ref<Quantity> activeEnergy_;
  Ref<Quantity> goalEnergy_;
};

class ExerciseChartDetailCell : public ChartDetailCell {
 public:
  static Class& staticClass();

  void setBriskMinutesGoalPercent(Ref<Quantity> briskMinutes, Ref<Quantity> goal, double percent);

 protected:
  void configure() override;

 private:
  Ref<Quantity> briskMinutes_;
  Ref<Quantity> goal_;
};

}  // namespace ax::host
