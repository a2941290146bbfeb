#include "platform/formatting/CalendarMath.h"

#include <algorithm>
#include <chrono>
#include <cmath>

#include "platform/formatting/Text.h"
#include "platform/formatting/ZoneRanges.h"

namespace ax::formatting {
namespace {

constexpr double kDay = 86400;

}  // namespace

CalendarFields calendarFields(double time) {
  using namespace std::chrono;
  time = boundedTime(time);
  const auto local = static_cast<std::int64_t>(std::floor(time + zoneRangeAt(time).offset));
  const sys_days day = floor<days>(sys_seconds(seconds(local)));
  const year_month_day date(day);
  const int inDay = static_cast<int>(local - day.time_since_epoch().count() * 86400LL);
  return {int(date.year()),
          static_cast<int>(unsigned(date.month())),
          static_cast<int>(unsigned(date.day())),
          inDay / 3600,
          inDay / 60 % 60,
          inDay % 60,
          static_cast<int>(weekday(day).c_encoding()) + 1};
}

double startOfDay(double time) {
  time = boundedTime(time);
  const ZoneRange& range = zoneRangeAt(time);
  const double localMidnight = std::floor((time + range.offset) / kDay) * kDay;
  const double beforeChange = localMidnight - range.formerOffset;
  if (beforeChange < range.from) return beforeChange;
  return std::max(localMidnight - range.offset, range.from);
}

std::int64_t dayNumber(double time) {
  time = boundedTime(time);
  return static_cast<std::int64_t>(std::floor((time + zoneRangeAt(time).offset) / kDay));
}

double zoneOffset(double time) {
  return zoneRangeAt(boundedTime(time)).offset;
}

double daylightSavingOffset(double time) {
  return zoneRangeAt(boundedTime(time)).daylight;
}

}  // namespace ax::formatting
