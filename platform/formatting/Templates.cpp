#include "platform/formatting/Templates.h"

#include <algorithm>
#include <iterator>
#include <utility>

#include "platform/formatting/Region.h"

namespace ax::formatting {
namespace {

constexpr std::string_view kHours = "hHkKjJC";
constexpr std::string_view kDays = "yYuUGMLdDEec";
constexpr std::string_view kLeftOut = "xXzZOvVabB";  // zones, and halves of the day, which go with the hour
constexpr std::string_view kNames = "MLEec";
constexpr std::size_t kAbbreviated = 3;

bool isLetter(char c) {
  return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}

bool isIn(char c, std::string_view letters) {
  return letters.find(c) != std::string_view::npos;
}

// A weekday is abbreviated with one letter to three, a month with three alone; fewer are numbers.
bool isAbbreviatedName(char letter, std::size_t count) {
  return letter == 'E' ? count <= kAbbreviated : isIn(letter, kNames) && count == kAbbreviated;
}

std::string field(char letter, std::size_t count) {
  if (!isLetter(letter) || isIn(letter, kLeftOut)) return {};
  if (isIn(letter, kHours)) return "j";
  return std::string(isAbbreviatedName(letter, count) ? kAbbreviated + 1 : count, letter);
}

// What follows the number of a day: " mars", or "–7 mars" in a span.
bool isBeforeMonth(std::string_view rest) {
  constexpr std::string_view dash = "\xE2\x80\x93";
  if (rest.starts_with(dash)) {
    rest.remove_prefix(dash.size());
    const std::size_t days = std::min(rest.find_first_not_of("0123456789"), rest.size());
    if (days == 0) return false;
    rest.remove_prefix(days);
  }
  return rest.size() > 1 && rest[0] == ' ' && isLetter(rest[1]) && rest[1] != 'h';
}

std::string withSpokenFirst(std::string date) {
  for (std::size_t at = date.size(); at-- > 0;) {
    const bool begins = at == 0 || !isIn(date[at - 1], "0123456789:,.");
    if (date[at] == '1' && begins && isBeforeMonth(std::string_view(date).substr(at + 1))) {
      date.insert(at + 1, "er");
    }
  }
  return date;
}

// Arabic writes the halves of the day as single letters.
constexpr std::pair<std::string_view, std::string_view> kHalves[] = {{"ص", "صباحًا"}, {"م", "مساءً"}};

// A letter alone stands between blanks or other marks, none of which begins as a letter does.
bool isAlone(std::string_view date, std::size_t at, std::size_t length) {
  const auto isLetterByte = [&](std::size_t i) {
    const auto byte = static_cast<unsigned char>(date[i]);
    return byte >= 0xD8 && byte <= 0xDB;
  };
  const std::size_t end = at + length;
  const bool begins = at < 2 || !isLetterByte(at - 2);
  return begins && (end == date.size() || !isLetterByte(end) || date.substr(end).starts_with("،"));
}

std::string withSpokenHalves(std::string date) {
  for (const auto& [letter, word] : kHalves) {
    for (std::size_t at = 0; (at = date.find(letter, at)) != std::string::npos;) {
      if (!isAlone(date, at, letter.size())) {
        at += letter.size();
        continue;
      }
      date.replace(at, letter.size(), word);
      at += word.size();
    }
  }
  return date;
}

}  // namespace

std::string spokenSkeleton(std::string_view dateTemplate) {
  std::string skeleton;
  for (std::size_t i = 0; i < dateTemplate.size();) {
    const std::size_t end = std::min(dateTemplate.find_first_not_of(dateTemplate[i], i), dateTemplate.size());
    skeleton += field(dateTemplate[i], end - i);
    i = end;
  }
  return skeleton;
}

std::string asSpoken(std::string date) {
  const std::string language = currentLanguage();
  if (language == "fr") return withSpokenFirst(std::move(date));
  if (language == "ar") return withSpokenHalves(std::move(date));
  return date;
}

std::string withoutLeadingZeros(std::string times) {
  constexpr std::string_view kBefore[] = {" ", "\xC2\xA0", "\xE2\x80\xAF", "\xE2\x80\x89", "\xE2\x80\x93",
                                          "-"};
  for (std::size_t at = times.size(); at-- > 0;) {
    const std::string_view before = std::string_view(times).substr(0, at);
    const bool begins = at == 0 || std::any_of(std::begin(kBefore), std::end(kBefore),
                                               [&](std::string_view mark) { return before.ends_with(mark); });
    if (begins && times[at] == '0' && at + 1 < times.size() && isIn(times[at + 1], "0123456789"))
      times.erase(at, 1);
  }
  return times;
}

bool tellsTime(std::string_view skeleton) {
  return skeleton.find_first_of(kHours) != std::string_view::npos;
}

bool tellsDay(std::string_view skeleton) {
  return skeleton.find_first_of(kDays) != std::string_view::npos;
}

}  // namespace ax::formatting
