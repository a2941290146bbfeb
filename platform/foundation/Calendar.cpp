#include "platform/foundation/Calendar.h"

#include "platform/base/NeverDestroyed.h"
#include "platform/formatting/CalendarMath.h"
#include "platform/foundation/String.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax {

Class& DateComponents::staticClass() {
  static Class& result = ClassBuilder<DateComponents>("DateComponents", Object::staticClass())
                             .instanceVariable<&DateComponents::year>("year")
                             .instanceVariable<&DateComponents::month>("month")
                             .instanceVariable<&DateComponents::day>("day")
                             .instanceVariable<&DateComponents::weekday>("weekday")
                             .build();
  return result;
}

Class& Calendar::staticClass() {
  static Class& result = ClassBuilder<Calendar>("Calendar", Object::staticClass())
                             .classMethod<&Calendar::currentCalendar>("currentCalendar")
                             .build();
  return result;
}

Ref<Calendar> Calendar::currentCalendar() {
  static NeverDestroyed<Ref<Calendar>> calendar(make<Calendar>());
  return *calendar;
}

Ref<Calendar> Calendar::calendarWithIdentifier(const Ref<String>& identifier) {
  return identifier && identifier->text() == CalendarIdentifierGregorian ? make<Calendar>() : nullptr;
}

Ref<DateComponents> Calendar::componentsFromDate(const Date& date) const {
  const formatting::CalendarFields fields = formatting::calendarFields(date.timeIntervalSince1970());
  Ref<DateComponents> components = make<DateComponents>();
  components->year = fields.year;
  components->month = fields.month;
  components->day = fields.day;
  components->hour = fields.hour;
  components->minute = fields.minute;
  components->second = fields.second;
  components->weekday = fields.weekday;
  return components;
}

Ref<Date> Calendar::startOfDayForDate(const Date& moment) const {
  return date(formatting::startOfDay(moment.timeIntervalSince1970()));
}

int Calendar::weekdayOfDate(const Date& date) const {
  return formatting::calendarFields(date.timeIntervalSince1970()).weekday;
}

TimeInterval Calendar::daylightSavingTimeOffsetForDate(const Date& date) const {
  return formatting::daylightSavingOffset(date.timeIntervalSince1970());
}

static const RegisteredClass<DateComponents> registeredComponents;
static const RegisteredClass<Calendar> registered;

}  // namespace ax
