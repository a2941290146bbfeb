#include "bundle/calendar/PaletteWeek.h"

#include <algorithm>
#include <cmath>

#include "bundle/shared/DayRings.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/base/NeverDestroyed.h"
#include "platform/foundation/Calendar.h"
#include "platform/foundation/Environment.h"
#include "platform/foundation/Formatters.h"
#include "platform/toolkit/AccessibilityMessages.h"
#include "platform/toolkit/SpokenText.h"

namespace ax {

namespace {

constexpr TimeInterval day = 86400;

const DateFormatter& weekdayFormatter() {
  static NeverDestroyed<Ref<DateFormatter>> formatter(make<DateFormatter>());
  return **formatter;
}

}  // namespace

PaletteWeekdays PaletteWeekdays::current() {
  PaletteWeekdays weekdays;
  weekdays.names_ = weekdayFormatter().standaloneWeekdaySymbols();
  weekdays.firstDay_ = static_cast<std::uint64_t>(firstDayOfWeekForWeeklyGoalCalculations());
  weekdays.today_ = static_cast<std::uint64_t>(Calendar::currentCalendar()->weekdayOfDate(*Date::now()));
  return weekdays;
}

Ref<String> PaletteWeekdays::labelAt(std::size_t position) const {
  const std::uint64_t weekday = (position + firstDay_ - 1) % daysOfWeek;
  const bool isToday = weekday == today_ - 1;
  return stringForVariables({isToday ? accessibilityLocalizedString("today.indicator") : nullptr,
                             cast<String>(names_->at(weekday)), stringForVariablesSentinel});
}

void fillDayValues(const Array& labels, const Date& shown) {
  const int daysSinceMonday =
      (Calendar::currentCalendar()->weekdayOfDate(shown) + 5) % static_cast<int>(daysOfWeek);
  for (std::size_t i = 0; i < std::min(daysOfWeek, labels.count()); ++i) {
    const Ref<Date> date = shown.dateByAddingTimeInterval((static_cast<int>(i) - daysSinceMonday) * day);
    const Ref<String> rings = accessibilityVeltoStringForDate(date, true);
    messages::setAccessibilityValue(labels.at(i), rings ? rings : accessibilityLocalizedString("no.data"));
  }
}

std::size_t sliceAt(double x, double width) {
  const double slice = std::floor(x / (width / daysOfWeek));
  if (!(slice > 0)) return 0;
  constexpr double behindTheLast = 1e9;
  return static_cast<std::size_t>(std::min(slice, behindTheLast));
}

}  // namespace ax
