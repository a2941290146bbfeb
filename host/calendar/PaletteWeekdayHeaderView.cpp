#include "host/calendar/PaletteWeekdayHeaderView.h"

#include "host/core/Layout.h"
#include "platform/foundation/Calendar.h"
#include "platform/foundation/Environment.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

constexpr int daysOfWeek = 7;
constexpr double dimmed = 0.5;

// 0 is the first day of the weekly goals.
int columnOfWeekday(int weekday) {
  return (weekday - firstDayOfWeekForWeeklyGoalCalculations() + daysOfWeek) % daysOfWeek;
}

Ref<String> initialOfColumn(int column) {
  const int daysAfterSunday = (column + firstDayOfWeekForWeeklyGoalCalculations() - 1) % daysOfWeek;
  // The noons of some week, at which it is the same day whether or not the clocks change in between.
  const Ref<Calendar> calendar = Calendar::currentCalendar();
  const Ref<Date> midnight = calendar->startOfDayForDate(*date(0));
  const int daysAhead = daysAfterSunday + 1 - calendar->weekdayOfDate(*midnight);
  return dateStringForFormat(midnight->dateByAddingTimeInterval((daysAhead + 0.5) * 86400), "EEEEE");
}

}  // namespace

Class& PaletteWeekdayHeaderView::staticClass() {
  using T = PaletteWeekdayHeaderView;
  static Class& result =
      ClassBuilder<T>("PaletteWeekdayHeaderView", View::staticClass())
          .instanceVariable<&T::weekdayLabels_>("_weekdayLabels")
          .method<&T::initWithNavigationPalette>("initWithNavigationPalette:")
          .method<&T::highlightWeekdayLabelForDateAndSetDay>("highlightWeekdayLabelForDateAndSetDay:")
          .build();
  return result;
}

Ref<Object> PaletteWeekdayHeaderView::initWithNavigationPalette(Ref<Object>) {
  weekdayLabels_ = make<MutableArray>();
  for (int column = 0; column < daysOfWeek; ++column) {
    const Ref<Label> label = make<Label>();
    label->setText(initialOfColumn(column));
    weekdayLabels_->axSafelyAddObject(label);
  }
  return Ref<Object>(this);
}

void PaletteWeekdayHeaderView::highlightWeekdayLabelForDateAndSetDay(Ref<Object> shown) {
  const Date* date = cast<Date>(shown.get());
  if (date == nullptr || !weekdayLabels_) return;
  const int column = columnOfWeekday(Calendar::currentCalendar()->weekdayOfDate(*date));
  int i = 0;
  for (const Ref<Object>& label : *weekdayLabels_) {
    if (View* view = cast<View>(label.get())) view->setAlpha(i == column ? 1 : dimmed);
    ++i;
  }
}

void PaletteWeekdayHeaderView::layoutSubviews() {
  if (!weekdayLabels_) initWithNavigationPalette(nullptr);
  const std::size_t count = weekdayLabels_->count();
  for (std::size_t i = 0; i < count; ++i) {
    addUnplaced(*this, cast<View>(weekdayLabels_->at(i)), columnOf(*this, i, count));
  }
}

static const RegisteredClass<PaletteWeekdayHeaderView> registered;

}  // namespace ax::host
