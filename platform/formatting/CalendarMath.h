// The Gregorian calendar in the current zone. Times are seconds since 1970-01-01T00:00:00Z. Made to be
// called for each of 100,000 readings: warm calls allocate nothing. Main thread only.
// A time farther than about 28,500 years from 1970 counts as that limit, NaN as 0.
#pragma once

#include <cstdint>

#include "platform/formatting/IsoTime.h"

namespace ax::formatting {

struct CalendarFields {
  int year;
  int month;  // 1 to 12
  int day;    // 1 to 31
  int hour;   // 0 to 23
  int minute;
  int second;
  int weekday;  // 1 is Sunday, 7 Saturday
};

CalendarFields calendarFields(double time);

// The first instant of the local day that holds `time`: 01:00 where clocks skip midnight, and the
// earlier midnight where it comes twice.
double startOfDay(double time);

// Days since 1970-01-01 of the local calendar day that holds `time`.
std::int64_t dayNumber(double time);

// Local clocks minus UTC, daylight saving included, in seconds.
double zoneOffset(double time);

// The daylight saving in force, in seconds; 0 in winter.
double daylightSavingOffset(double time);

}  // namespace ax::formatting
