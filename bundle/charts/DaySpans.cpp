#include "bundle/charts/DaySpans.h"

#include "platform/foundation/Calendar.h"

namespace ax {

DaySpans::DaySpans(TimeInterval step, std::string_view dateTemplate)
    : step_(step),
      template_(dateTemplate),
      dayStart_(Calendar::currentCalendar()->startOfDayForDate(*Date::now())),
      formatter_(make<DateIntervalFormatter>()) {}

Ref<String> DaySpans::text(std::size_t index, bool isLast) {
  const Ref<Date> start = dayStart_->dateByAddingTimeInterval(static_cast<double>(index) * step_);
  const Ref<Date> end = start->dateByAddingTimeInterval(isLast ? step_ - 1 : step_);
  formatter_->setDateTemplate(isLast ? "h:mma" : template_);
  return formatter_->stringFromDateToDate(*start, *end);
}

}  // namespace ax
