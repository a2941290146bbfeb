#include "host/daydetail/ChartDetailCell.h"

#include "host/core/HostStrings.h"
#include "host/core/Layout.h"
#include "host/daydetail/VLUIUnitManager.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

const Message<void(Ref<Object>)> addChartLabel{"addChartLabelWithUnit:"};
const Message<void(Ref<Object>, Ref<Object>, double)> setActiveEnergy{"setActiveEnergy:goalEnergy:percent:"};
const Message<void(Ref<Object>, Ref<Object>, double)> setBriskMinutes{"setBriskMinutes:goal:percent:"};

double amountIn(const Ref<Unit>& unit, const Ref<Quantity>& quantity) {
  return quantity ? quantity->doubleValueForUnit(unit) : 0;
}

}  // namespace

Class& ChartDetailCell::staticClass() {
  using T = ChartDetailCell;
  static Class& result = ClassBuilder<T>("ChartDetailCell", TableViewCell::staticClass())
                             .method<&T::chartLabel>("chartLabel")
                             .method<&T::addChartLabelWithUnit>("addChartLabelWithUnit:")
                             .instanceVariable<&T::value_>("_value")
                             .instanceVariable<&T::scrollview_>("_scrollview")
                             .instanceVariable<&T::pageControl_>("_pageControl")
                             .instanceVariable<&T::unit_>("_unit")
                             .instanceVariable<&T::percent_>("_percent")
                             .build();
  return result;
}

void ChartDetailCell::addChartLabelWithUnit(Ref<Object> unit) {
  if (chartLabel_) chartLabel_->removeFromSuperview();
  chartLabel_ = make<Label>();
  chartLabel_->setText(unit ? string(unit->description()) : nullptr);
  if (scrollview_) scrollview_->addSubview(chartLabel_);
}

void ChartDetailCell::layoutSubviews() {
  if (!isConfigured_) {
    isConfigured_ = true;
    configure();
    if (unit_) addChartLabel(*this, unit_);
  }
  addUnplaced(*contentView(), {value_, scrollview_, pageControl_});
}

void ChartDetailCell::showFigure(double amount, double goal, std::string_view unitKey, double percent) {
  percent_ = percent;
  if (!value_) value_ = make<Label>();
  value_->setText(string(formatFloat(FloatFormat::whole, static_cast<float>(amount))->text() + "/" +
                         formatFloat(FloatFormat::whole, static_cast<float>(goal))->text() + " " +
                         hostText(unitKey)->text()));
}

Class& MoveChartDetailCell::staticClass() {
  using T = MoveChartDetailCell;
  static Class& result =
      ClassBuilder<T>("MoveChartDetailCell", ChartDetailCell::staticClass())
          .instanceVariable<&T::activeEnergy_>("_activeEnergy")
          .instanceVariable<&T::goalEnergy_>("_goalEnergy")
          .method<&T::setActiveEnergyGoalEnergyPercent>("setActiveEnergy:goalEnergy:percent:")
          .build();
  return result;
}

void MoveChartDetailCell::setActiveEnergyGoalEnergyPercent(Ref<Quantity> activeEnergy,
                                                           Ref<Quantity> goalEnergy, double percent) {
  activeEnergy_ = activeEnergy;
  goalEnergy_ = goalEnergy;
  const Ref<Unit> unit = VLUIUnitManager::sharedManager()->userActiveEnergyBurnedUnit();
  showFigure(amountIn(unit, activeEnergy), amountIn(unit, goalEnergy),
             unit->text() == "kJ" ? "unit.kj" : "unit.kcal", percent);
}

void MoveChartDetailCell::configure() {
  if (activeEnergy_ || goalEnergy_) setActiveEnergy(*this, activeEnergy_, goalEnergy_, percent());
}

Class& ExerciseChartDetailCell::staticClass() {
  using T = ExerciseChartDetailCell;
  static Class& result = ClassBuilder<T>("ExerciseChartDetailCell", ChartDetailCell::staticClass())
                             .instanceVariable<&T::briskMinutes_>("_briskMinutes")
                             .instanceVariable<&T::goal_>("_goal")
                             .method<&T::setBriskMinutesGoalPercent>("setBriskMinutes:goal:percent:")
                             .build();
  return result;
}

void ExerciseChartDetailCell::setBriskMinutesGoalPercent(Ref<Quantity> briskMinutes, Ref<Quantity> goal,
                                                         double percent) {
  briskMinutes_ = briskMinutes;
  goal_ = goal;
  const Ref<Unit> minutes = Unit::minuteUnit();
  showFigure(amountIn(minutes, briskMinutes), amountIn(minutes, goal), "unit.min", percent);
}

void ExerciseChartDetailCell::configure() {
  if (briskMinutes_ || goal_) setBriskMinutes(*this, briskMinutes_, goal_, percent());
}

static const RegisteredClass<ChartDetailCell> registered;
static const RegisteredClass<MoveChartDetailCell> registeredMoveCell;
static const RegisteredClass<ExerciseChartDetailCell> registeredExerciseCell;

}  // namespace ax::host
