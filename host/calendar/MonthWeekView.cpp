#include "host/calendar/MonthWeekView.h"

#include "host/calendar/QSCalendarDayCell.h"
#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

constexpr double titleHeight = 24;
constexpr double goalWidth = 160;
constexpr double ringSize = 30;
constexpr double daysInRow = 7;

}  // namespace

Class& VeltoMonthTitleLabel::staticClass() {
  static Class& result =
      ClassBuilder<VeltoMonthTitleLabel>("_VeltoMonthTitleLabel", Label::staticClass()).build();
  return result;
}

Class& QSCalendarWeekView::staticClass() {
  using T = QSCalendarWeekView;
  static Class& result = ClassBuilder<T>("QSCalendarWeekView", View::staticClass())
                             .property<&T::monthTitleView, &T::setMonthTitleView>("monthTitleView")
                             .build();
  return result;
}

void QSCalendarWeekView::layoutSubviews() {
  addUnplaced(*this, monthTitleView_, {0, 0, frame().width, titleHeight});
}

Class& MonthWeekView::staticClass() {
  using T = MonthWeekView;
  static Class& result = ClassBuilder<T>("MonthWeekView", QSCalendarWeekView::staticClass())
                             .instanceVariable<&T::goalTextLabel_>("_goalTextLabel")
                             .instanceVariable<&T::goalPercentChangeTextLabel_>("_goalPercentChangeTextLabel")
                             .instanceVariable<&T::topBorderLineOnDrag_>("_topBorderLineOnDrag")
                             .build();
  return result;
}

void MonthWeekView::layoutSubviews() {
  QSCalendarWeekView::layoutSubviews();
  addUnplaced(*this, goalTextLabel_, inDirection(*this, {0, titleHeight, goalWidth, titleHeight}));
  addUnplaced(*this, goalPercentChangeTextLabel_,
              inDirection(*this, {goalWidth, titleHeight, goalWidth, titleHeight}));
  layer()->addSublayer(topBorderLineOnDrag_);
  layOutDays();
}

void MonthWeekView::layOutDays() {
  const double column = frame().width / daysInRow;
  double x = (column - ringSize) / 2;
  for (const Ref<Layer>& day : layer()->sublayers()) {
    if (cast<QSCalendarDayCell>(day.get()) == nullptr) continue;
    if (day->frame() == Rect()) day->setFrame(inDirection(*this, {x, 2 * titleHeight, ringSize, ringSize}));
    x += column;
  }
}

static const RegisteredClass<VeltoMonthTitleLabel> registeredTitle;
static const RegisteredClass<QSCalendarWeekView> registeredWeek;
static const RegisteredClass<MonthWeekView> registered;

}  // namespace ax::host
