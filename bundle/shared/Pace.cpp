#include "bundle/shared/Pace.h"

#include <cstdint>
#include <limits>
#include <string_view>
#include <vector>

#include "bundle/shared/LocalizedString.h"
#include "platform/base/NeverDestroyed.h"
#include "platform/formatting/Digits.h"
#include "platform/formatting/RegularExpression.h"
#include "platform/foundation/Formatters.h"

using namespace ax;

bool ax::marksMissingData(const String& text) {
  return text.contains("--") || text.contains("\u2013\u2013");
}

namespace {

// Minutes and seconds. Groups: whole match, minutes, seconds.
constexpr std::size_t paceRanges = 3;

std::vector<formatting::TextRange> findPace(const std::string& text) {
  static NeverDestroyed<formatting::RegularExpression> pattern(R"re((\d+)'\s?([0-5]?[0-9])(?:''|"))re");
  return pattern->firstMatch(text);
}

// As many seconds as fit.
std::int64_t secondsOf(std::string_view minutes, std::string_view seconds) {
  std::int64_t total = 0;
  const bool overflows = __builtin_mul_overflow(formatting::wholeNumber(minutes), 60, &total) ||
                         __builtin_add_overflow(total, formatting::wholeNumber(seconds), &total);
  return overflows ? std::numeric_limits<std::int64_t>::max() : total;
}

Ref<AccessibilityAttributedString> withSpokenPace(const std::string& text,
                                                  const std::vector<formatting::TextRange>& pace,
                                                  const NumberFormatter& formatter) {
  const std::int64_t seconds = secondsOf(pace[1].in(text), pace[2].in(text));
  const Ref<String> formatted = formatter.stringFromNumber(number(seconds));
  const std::string total = formatted ? formatted->text() : "";
  const std::size_t start = pace[0].from;
  auto spoken = make<AccessibilityAttributedString>(std::string(text).replace(start, pace[0].length, total));
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
  const std::vector<formatting::TextRange> pace = findPace(string->text());
  if (pace.size() != paceRanges) return AccessibilityAttributedString::initWithString(string);
  return withSpokenPace(string->text(), pace, *formatter);
}
