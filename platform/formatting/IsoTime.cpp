#include "platform/formatting/IsoTime.h"

#include <algorithm>
#include <charconv>
#include <chrono>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstdlib>

#include "platform/formatting/CalendarMath.h"
#include "platform/formatting/Text.h"
#include "platform/formatting/ZoneRanges.h"

namespace ax::formatting {
namespace {

// Takes a text apart from the left. Each step takes what it matched; on a mismatch it takes nothing.
struct Scanner {
  std::string_view rest;

  bool take(std::string_view anyOf) {
    if (rest.empty() || anyOf.find(rest.front()) == std::string_view::npos) return false;
    rest.remove_prefix(1);
    return true;
  }

  std::optional<int> takeNumber(std::size_t digits, int most) {
    int value = 0;
    if (rest.size() < digits || rest.front() == '-') return std::nullopt;
    const char* end = rest.data() + digits;
    const auto [stop, error] = std::from_chars(rest.data(), end, value);
    if (error != std::errc{} || stop != end || value > most) return std::nullopt;
    rest.remove_prefix(digits);
    return value;
  }

  // ".250" or ",250"; 0 where there is none. Digits that no double of this size tells apart do not count.
  std::optional<double> takeFraction() {
    if (!take(".,")) return 0.0;
    const std::size_t digits = std::min(rest.find_first_not_of("0123456789"), rest.size());
    if (digits == 0) return std::nullopt;
    double value = 0;
    double scale = 1;
    for (const char digit : rest.substr(0, std::min<std::size_t>(digits, 15))) {
      value = value * 10 + (digit - '0');
      scale *= 10;
    }
    rest.remove_prefix(digits);
    return value / scale;
  }
};

// Seconds since 1970-01-01, as if local time were UTC.
std::optional<double> takeDate(Scanner& scanner) {
  using namespace std::chrono;
  const auto y = scanner.takeNumber(4, 9999);
  if (!y || !scanner.take("-")) return std::nullopt;
  const auto m = scanner.takeNumber(2, 12);
  if (!m || !scanner.take("-")) return std::nullopt;
  const auto d = scanner.takeNumber(2, 31);
  if (!d) return std::nullopt;
  const year_month_day date{year{*y}, month{static_cast<unsigned>(*m)}, day{static_cast<unsigned>(*d)}};
  if (!date.ok()) return std::nullopt;
  return sys_days(date).time_since_epoch().count() * 86400.0;
}

std::optional<double> takeClock(Scanner& scanner) {
  const auto hour = scanner.takeNumber(2, 23);
  if (!hour || !scanner.take(":")) return std::nullopt;
  const auto minute = scanner.takeNumber(2, 59);
  if (!minute) return std::nullopt;
  const double seconds = *hour * 3600.0 + *minute * 60.0;
  if (!scanner.take(":")) return seconds;
  const auto second = scanner.takeNumber(2, 60);  // 60: a leap second
  if (!second) return std::nullopt;
  const auto fraction = scanner.takeFraction();
  return fraction ? std::optional(seconds + *second + *fraction) : std::nullopt;
}

// "+01:00", "+0100" or "+01".
std::optional<double> takeOffset(Scanner& scanner) {
  const double direction = scanner.rest.starts_with('-') ? -1 : 1;
  if (!scanner.take("+-")) return std::nullopt;
  const auto hours = scanner.takeNumber(2, 23);
  if (!hours || scanner.rest.empty()) return hours ? std::optional(direction * *hours * 3600) : std::nullopt;
  scanner.take(":");
  const auto minutes = scanner.takeNumber(2, 59);
  return minutes ? std::optional(direction * (*hours * 3600.0 + *minutes * 60.0)) : std::nullopt;
}

std::string isoOfLocal(double local) {
  using namespace std::chrono;
  const auto whole = static_cast<std::int64_t>(std::floor(local));
  const sys_days day = floor<days>(sys_seconds(seconds(whole)));
  const year_month_day date(day);
  const int inDay = static_cast<int>(whole - day.time_since_epoch().count() * 86400LL);
  char text[48];
  std::snprintf(text, sizeof text, "%04d-%02u-%02uT%02d:%02d:%02d", int(date.year()), unsigned(date.month()),
                unsigned(date.day()), inDay / 3600, inDay / 60 % 60, inDay % 60);
  return text;
}

}  // namespace

std::optional<IsoTime> readIso(std::string_view text) {
  Scanner scanner{text};
  IsoTime time;
  const auto date = takeDate(scanner);
  if (!date) return std::nullopt;
  time.local = *date;
  if (scanner.rest.empty()) return time;
  if (!scanner.take("Tt ")) return std::nullopt;
  const auto clock = takeClock(scanner);
  if (!clock) return std::nullopt;
  time.local += *clock;
  time.hasClock = true;
  time.isUtc = scanner.take("Zz");
  if (!time.isUtc && !scanner.rest.empty()) {
    time.offset = takeOffset(scanner);
    if (!time.offset) return std::nullopt;
  }
  return scanner.rest.empty() ? std::optional(time) : std::nullopt;
}

std::optional<double> timeFromIso(std::string_view text) {
  const auto time = readIso(text);
  if (!time) return std::nullopt;
  if (time->isUtc || time->offset) return time->local - time->offset.value_or(0);
  return currentZoneRanges()->instantOfLocal(time->local,
                                             time->hasClock ? RepeatedTime::last : RepeatedTime::first);
}

std::string isoFromTime(double time) {
  return isoOfLocal(boundedTime(time) + zoneOffset(time));
}

std::string isoWithOffset(double time) {
  const int minutes = static_cast<int>(std::lround(zoneOffset(time) / 60));
  char offset[16];
  std::snprintf(offset, sizeof offset, "%c%02d:%02d", minutes < 0 ? '-' : '+', std::abs(minutes) / 60,
                std::abs(minutes) % 60);
  return isoOfLocal(boundedTime(time) + minutes * 60.0) + offset;
}

}  // namespace ax::formatting
