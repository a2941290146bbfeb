#include "bundle/shared/Pace.h"

#include <algorithm>
#include <charconv>
#include <limits>
#include <regex>

#include "bundle/shared/LocalizedString.h"
#include "platform/foundation/Formatters.h"

using namespace ax;

bool ax::marksMissingData(const String& text) {
  return text.contains("--") || text.contains("\u2013\u2013");
}

namespace {

const std::regex& pacePattern() {
  // The pattern reads bytes: it knows the spaces of other alphabets only when they are spelled out.
  static const auto& pattern = *new std::regex(
      "(\\d+)'(?:\\s|\u00a0|\u1680|\u2000|\u2001|\u2002|\u2003|\u2004|\u2005"
      "|\u2006|\u2007|\u2008|\u2009|\u200a|\u2028|\u2029|\u202f|\u205f|\u3000)?([0-5]?[0-9])(?:''|\")");
  return pattern;
}

// Every further digit costs the pattern stack, and no pace has so many.
bool hasEndlessNumber(const std::string& text) {
  constexpr int tooManyDigits = 1000;
  const auto isDigit = [](char c, int) { return c >= '0' && c <= '9'; };
  return std::search_n(text.begin(), text.end(), tooManyDigits, 0, isDigit) != text.end();
}

// As many seconds as fit.
std::int64_t secondsOf(const std::string& minutes, const std::string& seconds) {
  std::int64_t wholeMinutes = 0;
  std::int64_t rest = 0;
  std::from_chars(seconds.data(), seconds.data() + seconds.size(), rest);
  const auto read = std::from_chars(minutes.data(), minutes.data() + minutes.size(), wholeMinutes);
  std::int64_t total = 0;
  const bool overflows = read.ec != std::errc() || __builtin_mul_overflow(wholeMinutes, 60, &total) ||
                         __builtin_add_overflow(total, rest, &total);
  return overflows ? std::numeric_limits<std::int64_t>::max() : total;
}

Ref<AccessibilityAttributedString> withSpokenPace(const std::smatch& pace, const NumberFormatter& formatter) {
  const Ref<String> formatted = formatter.stringFromNumber(number(secondsOf(pace[1], pace[2])));
  const std::string total = formatted ? formatted->text() : "";
  const auto start = static_cast<std::size_t>(pace.position());
  auto spoken = make<AccessibilityAttributedString>(pace.prefix().str() + total + pace.suffix().str());
  if (spoken->text().compare(start, total.size(), total) == 0) {
    spoken->setAttributeForKeyWithRange(number(true), DurationTimeMMSS, {start, total.size()});
  }
  return spoken;
}

}  // namespace

Ref<AccessibilityAttributedString> accessibilityAttributedStringForPaceContainingString(
    const Ref<String>& string) {
  if (isEmpty(string)) return nullptr;
  if (marksMissingData(*string)) {
    return AccessibilityAttributedString::initWithString(ax::accessibilityLocalizedString("no.data"));
  }
  const Ref<NumberFormatter> formatter = make<NumberFormatter>();
  std::smatch pace;
  const bool found =
      !hasEndlessNumber(string->text()) && std::regex_search(string->text(), pace, pacePattern());
  if (!found || pace.size() != 3) return AccessibilityAttributedString::initWithString(string);
  return withSpokenPace(pace, *formatter);
}
