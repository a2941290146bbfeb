#pragma once

#include "platform/foundation/Date.h"
#include "platform/foundation/String.h"

namespace ax {

// The calendar fields of a moment.
class DateComponents final : public Object {
 public:
  static Class& staticClass();

  int year = 0;
  int month = 0;  // 1 to 12
  int day = 0;    // 1 to 31
  int hour = 0;
  int minute = 0;
  int second = 0;
  int weekday = 0;  // 1 is Sunday
};

// The Gregorian calendar, in the time zone that is current when it is asked.
class Calendar final : public Object {
 public:
  static Class& staticClass();

  static Ref<Calendar> currentCalendar();
  static Ref<Calendar> calendarWithIdentifier(const Ref<String>& identifier);

  Ref<DateComponents> componentsFromDate(const Date& date) const;
  Ref<Date> startOfDayForDate(const Date& date) const;
  int weekdayOfDate(const Date& date) const;  // 1 is Sunday
  // How far the clocks are put forward at a date.
  TimeInterval daylightSavingTimeOffsetForDate(const Date& date) const;
};

inline constexpr const char* CalendarIdentifierGregorian = "gregorian";

}  // namespace ax
