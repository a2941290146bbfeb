#include "platform/formatting/IsoTime.h"

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

// Takes text off the front; `good` turns false at the first thing that does not fit.
class Reader {
 public:
  explicit Reader(std::string_view text) : rest_(text) {}

  bool good() const { return good_; }
  bool atEnd() const { return rest_.empty(); }
  bool skip(char c) {
    if (rest_.empty() || rest_.front() != c) return false;
    rest_.remove_prefix(1);
    return true;
  }
  void expect(char c) {
    if (!skip(c)) good_ = false;
  }
  int number(std::size_t digits, int largest);
  double fraction();

 private:
  bool startsWithDigit() const { return !rest_.empty() && rest_.front() >= '0' && rest_.front() <= '9'; }
  int digit() {
    const int value = rest_.front() - '0';
    rest_.remove_prefix(1);
    return value;
  }

  std::string_view rest_;
  bool good_ = true;
};

int Reader::number(std::size_t digits, int largest) {
  int value = 0;
  for (std::size_t i = 0; i < digits; ++i) {
    if (!startsWithDigit()) {
      good_ = false;
      return 0;
    }
    value = value * 10 + digit();
  }
  if (value > largest) good_ = false;
  return value;
}

double Reader::fraction() {
  if (!startsWithDigit()) good_ = false;
  double value = 0;
  for (double scale = 0.1; startsWithDigit(); scale /= 10) value += digit() * scale;
  return value;
}

// Seconds of the date since 1970-01-01, as if local time were UTC.
double readDate(Reader& reader, bool& exists) {
  using namespace std::chrono;
  const year y{reader.number(4, 9999)};
  reader.expect('-');
  const month m{static_cast<unsigned>(reader.number(2, 12))};
  reader.expect('-');
  const day d{static_cast<unsigned>(reader.number(2, 31))};
  const year_month_day date{y, m, d};
  exists = reader.good() && date.ok();
  return exists ? sys_days(date).time_since_epoch().count() * 86400.0 : 0;
}

double readClock(Reader& reader) {
  const int hour = reader.number(2, 23);
  reader.expect(':');
  const int minute = reader.number(2, 59);
  reader.expect(':');
  double second = reader.number(2, 59);
  if (reader.skip('.')) second += reader.fraction();
  return hour * 3600 + minute * 60 + second;
}

std::optional<double> readOffset(Reader& reader) {
  if (reader.skip('Z')) return 0;
  const bool west = reader.skip('-');
  if (!west && !reader.skip('+')) return std::nullopt;
  const int hours = reader.number(2, 23);
  reader.skip(':');
  const double offset = hours * 3600 + reader.number(2, 59) * 60;
  return west ? -offset : offset;
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

std::optional<double> timeFromIso(std::string_view text) {
  Reader reader(text);
  bool exists = false;
  double local = readDate(reader, exists);
  if (!exists) return std::nullopt;
  if (reader.atEnd()) return currentZoneRanges()->instantOfLocal(local, RepeatedTime::first);
  reader.expect('T');
  local += readClock(reader);
  const std::optional<double> offset = readOffset(reader);
  if (!reader.good() || !reader.atEnd()) return std::nullopt;
  return offset ? local - *offset : currentZoneRanges()->instantOfLocal(local, RepeatedTime::last);
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
