#include "reader/importers/IsoTime.h"

#include <algorithm>
#include <charconv>
#include <chrono>

namespace ax::reader {
namespace {

// Takes a text apart from the left. Each step consumes what it matched; on a mismatch it consumes nothing.
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

  // ".250" or ",250"; 0 where there is none.
  std::optional<double> takeFraction() {
    if (!take(".,")) return 0.0;
    const std::size_t digits = std::min(rest.find_first_not_of("0123456789"), rest.size());
    if (digits == 0) return std::nullopt;
    double value = 0;
    double place = 0.1;
    for (const char digit : rest.substr(0, digits)) {
      value += (digit - '0') * place;
      place /= 10;
    }
    rest.remove_prefix(digits);
    return value;
  }
};

std::optional<double> takeDate(Scanner& scanner) {
  const auto year = scanner.takeNumber(4, 9999);
  if (!year || !scanner.take("-")) return std::nullopt;
  const auto month = scanner.takeNumber(2, 12);
  if (!month || !scanner.take("-")) return std::nullopt;
  const auto day = scanner.takeNumber(2, 31);
  if (!day) return std::nullopt;
  const std::chrono::year_month_day date{std::chrono::year{*year},
                                         std::chrono::month{static_cast<unsigned>(*month)},
                                         std::chrono::day{static_cast<unsigned>(*day)}};
  if (!date.ok()) return std::nullopt;
  return 86400.0 * std::chrono::sys_days{date}.time_since_epoch().count();
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
  if (!fraction) return std::nullopt;
  return seconds + *second + *fraction;
}

// "Z", "+01:00", "+0100", "+01" or nothing, as seconds east of UTC.
std::optional<double> takeOffset(Scanner& scanner) {
  if (scanner.rest.empty() || scanner.take("Zz")) return 0.0;
  const double direction = scanner.rest.front() == '-' ? -1 : 1;
  if (!scanner.take("+-")) return std::nullopt;
  const auto hours = scanner.takeNumber(2, 23);
  if (!hours) return std::nullopt;
  if (scanner.rest.empty()) return direction * *hours * 3600;
  scanner.take(":");
  const auto minutes = scanner.takeNumber(2, 59);
  if (!minutes) return std::nullopt;
  return direction * (*hours * 3600.0 + *minutes * 60.0);
}

struct IsoTime {
  double local;
  double offset;
  bool tellsOffset;
};

std::optional<IsoTime> takeTime(std::string_view text) {
  constexpr std::string_view blanks = " \t\r\n";
  text = text.substr(0, text.find_last_not_of(blanks) + 1);
  Scanner scanner{text.substr(std::min(text.find_first_not_of(blanks), text.size()))};
  const auto date = takeDate(scanner);
  if (!date || !scanner.take("Tt ")) return std::nullopt;
  const auto clock = takeClock(scanner);
  if (!clock) return std::nullopt;
  const bool tellsOffset = !scanner.rest.empty() && scanner.rest.find_first_of("Zz") != 0;
  const auto offset = takeOffset(scanner);
  if (!offset || !scanner.rest.empty()) return std::nullopt;
  return IsoTime{*date + *clock, *offset, tellsOffset};
}

}  // namespace

std::optional<double> parseIsoTime(std::string_view text) {
  const auto time = takeTime(text);
  return time ? std::optional(time->local - time->offset) : std::nullopt;
}

std::optional<double> offsetOfIsoTime(std::string_view text) {
  const auto time = takeTime(text);
  return time && time->tellsOffset ? std::optional(time->offset) : std::nullopt;
}

}  // namespace ax::reader
