#include "platform/formatting/DateIntervals.h"

#include <unicode/dtitvfmt.h>
#include <unicode/timezone.h>
#include <unicode/uchar.h>

#include <memory>

#include "platform/formatting/CalendarMath.h"
#include "platform/formatting/FormatterCache.h"
#include "platform/formatting/FormatterZone.h"
#include "platform/formatting/Templates.h"
#include "platform/formatting/Text.h"

namespace ax::formatting {
namespace {

struct IntervalWriter final : CachedFormatter {
  std::unique_ptr<icu::DateIntervalFormat> format;
};

// What a span of hours tells besides: nothing within one day, else the days, and the years if they differ.
enum class Days { one, several, overNewYear };

Days daysOf(double start, double end) {
  if (dayNumber(start) == dayNumber(end)) return Days::one;
  return calendarFields(start).year == calendarFields(end).year ? Days::several : Days::overNewYear;
}

std::string skeletonOf(std::string_view dateTemplate, Days days) {
  const std::string skeleton = spokenSkeleton(dateTemplate);
  if (days == Days::one || !tellsTime(skeleton) || tellsDay(skeleton)) return skeleton;
  return (days == Days::several ? "MMMMd" : "yMMMMd") + skeleton;
}

std::unique_ptr<IntervalWriter> writerOf(const std::string& skeleton) {
  UErrorCode status = U_ZERO_ERROR;
  const icu::Locale locale(gregorianLocaleName().c_str());
  auto writer = std::make_unique<IntervalWriter>();
  writer->format.reset(
      icu::DateIntervalFormat::createInstance(icu::UnicodeString::fromUTF8(skeleton), locale, status));
  if (U_FAILURE(status)) return nullptr;
  writer->format->adoptTimeZone(newFormatterZone<icu::TimeZone>());
  return writer;
}

icu::UnicodeString written(const IntervalWriter& writer, double start, double end) {
  const icu::DateInterval interval(start * 1000.0, end * 1000.0);
  icu::UnicodeString text;
  icu::FieldPosition ignored(icu::FieldPosition::DONT_CARE);
  UErrorCode status = U_ZERO_ERROR;
  writer.format->format(&interval, text, ignored, status);
  return U_SUCCESS(status) ? text : icu::UnicodeString();
}

bool hasLetters(const icu::UnicodeString& text) {
  for (int32_t i = 0; i < text.length(); ++i) {
    if (u_isalpha(text[i])) return true;
  }
  return false;
}

// Bare numbers of hours would not be heard as times; with their minutes they are.
std::unique_ptr<IntervalWriter> makeWriter(std::string_view dateTemplate, Days days) {
  const std::string skeleton = skeletonOf(dateTemplate, days);
  std::unique_ptr<IntervalWriter> writer = writerOf(skeleton);
  const bool isBare = writer && skeleton == "j" && !hasLetters(written(*writer, 0, 3600));
  return isBare ? writerOf("jmm") : std::move(writer);
}

}  // namespace

std::string dateIntervalString(double start, double end, std::string_view dateTemplate) {
  if (!isFormattableTime(start) || !isFormattableTime(end)) return {};
  const Days days = daysOf(start, end);
  const IntervalWriter* writer =
      formatterCache().get<IntervalWriter>(FormatterKind::dateInterval, static_cast<std::int32_t>(days),
                                           dateTemplate, [&] { return makeWriter(dateTemplate, days); });
  if (writer == nullptr) return {};
  const icu::UnicodeString text = written(*writer, start, end);
  return asSpoken(withoutLeadingZeros(utf8From({text.getBuffer(), static_cast<std::size_t>(text.length())})));
}

}  // namespace ax::formatting
