#include "platform/formatting/DateIntervals.h"

#include <unicode/dtitvfmt.h>
#include <unicode/timezone.h>

#include <memory>

#include "platform/formatting/FormatterCache.h"
#include "platform/formatting/Region.h"
#include "platform/formatting/Text.h"

namespace ax::formatting {
namespace {

struct IntervalWriter final : CachedFormatter {
  std::unique_ptr<icu::DateIntervalFormat> format;
};

// A zone offset would show up only where both ends fall together, as in "2 AM +00".
icu::UnicodeString skeletonOf(std::string_view dateTemplate) {
  icu::UnicodeString skeleton;
  for (const char c : dateTemplate) {
    const bool isLetter = (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
    if (isLetter && c != 'x' && c != 'X') skeleton.append(static_cast<char16_t>(c));
  }
  return skeleton;
}

std::unique_ptr<IntervalWriter> makeWriter(std::string_view dateTemplate) {
  UErrorCode status = U_ZERO_ERROR;
  const icu::Locale locale(gregorianLocaleName().c_str());
  auto writer = std::make_unique<IntervalWriter>();
  writer->format.reset(icu::DateIntervalFormat::createInstance(skeletonOf(dateTemplate), locale, status));
  if (U_FAILURE(status)) return nullptr;
  writer->format->adoptTimeZone(
      icu::TimeZone::createTimeZone(icu::UnicodeString::fromUTF8(currentRegion().timeZone)));
  return writer;
}

}  // namespace

std::string dateIntervalString(double start, double end, std::string_view dateTemplate) {
  if (!isFormattableTime(start) || !isFormattableTime(end)) return {};
  const IntervalWriter* writer = formatterCache().get<IntervalWriter>(
      FormatterKind::dateInterval, 0, dateTemplate, [&] { return makeWriter(dateTemplate); });
  if (writer == nullptr) return {};
  const icu::DateInterval interval(start * 1000.0, end * 1000.0);
  icu::UnicodeString text;
  icu::FieldPosition ignored(icu::FieldPosition::DONT_CARE);
  UErrorCode status = U_ZERO_ERROR;
  writer->format->format(&interval, text, ignored, status);
  if (U_FAILURE(status)) return {};
  return utf8From({text.getBuffer(), static_cast<std::size_t>(text.length())});
}

}  // namespace ax::formatting
