#include "platform/formatting/Dates.h"

#include <unicode/dtfmtsym.h>
#include <unicode/dtptngen.h>
#include <unicode/gregocal.h>
#include <unicode/smpdtfmt.h>

#include <memory>

#include "platform/base/NeverDestroyed.h"
#include "platform/formatting/FormatterCache.h"
#include "platform/formatting/FormatterZone.h"
#include "platform/formatting/PerRegion.h"
#include "platform/formatting/Region.h"
#include "platform/formatting/Templates.h"
#include "platform/formatting/Text.h"

namespace ax::formatting {
namespace {

constexpr UDate kTwoDigitYearStart = -631152000000.0;  // 1950-01-01, in milliseconds

struct PatternSource final : CachedFormatter {
  std::unique_ptr<icu::DateTimePatternGenerator> generator;
};

struct DateWriter final : CachedFormatter {
  std::unique_ptr<icu::DateFormat> format;
  bool tellsTime = false;
};

struct DateReader final : CachedFormatter {
  std::unique_ptr<icu::SimpleDateFormat> format;
  std::unique_ptr<icu::GregorianCalendar> calendar;
};

icu::UnicodeString unicode(std::string_view text) {
  return icu::UnicodeString::fromUTF8({text.data(), static_cast<int32_t>(text.size())});
}

icu::Locale gregorianLocale() {
  return icu::Locale(gregorianLocaleName().c_str());
}

icu::UnicodeString bestPattern(std::string_view pattern, UErrorCode& status) {
  const PatternSource* source =
      formatterCache().get<PatternSource>(FormatterKind::patternGenerator, 0, {}, [&] {
        auto made = std::make_unique<PatternSource>();
        made->generator.reset(icu::DateTimePatternGenerator::createInstance(gregorianLocale(), status));
        return U_SUCCESS(status) ? std::move(made) : nullptr;
      });
  if (source == nullptr) return {};
  const icu::UnicodeString skeleton =
      icu::DateTimePatternGenerator::staticGetSkeleton(unicode(pattern), status);
  std::string letters;
  skeleton.toUTF8String(letters);
  return source->generator->getBestPattern(unicode(spokenSkeleton(letters)), status);
}

std::unique_ptr<DateWriter> makeWriter(std::string_view pattern) {
  UErrorCode status = U_ZERO_ERROR;
  const icu::UnicodeString localized = bestPattern(pattern, status);
  auto writer = std::make_unique<DateWriter>();
  writer->format = std::make_unique<icu::SimpleDateFormat>(localized, gregorianLocale(), status);
  if (U_FAILURE(status)) return nullptr;
  writer->format->adoptTimeZone(newFormatterZone<icu::TimeZone>());
  writer->tellsTime = tellsTime(pattern);
  return writer;
}

std::unique_ptr<DateWriter> makeStyleWriter(DateStyle style) {
  constexpr icu::DateFormat::EStyle kStyles[] = {icu::DateFormat::kShort, icu::DateFormat::kLong,
                                                 icu::DateFormat::kLong, icu::DateFormat::kFull};
  const int index = static_cast<int>(style) - 1;
  if (index < 0 || index > 3) return nullptr;
  auto writer = std::make_unique<DateWriter>();
  writer->format.reset(icu::DateFormat::createDateInstance(kStyles[index], gregorianLocale()));
  if (!writer->format) return nullptr;
  writer->format->adoptTimeZone(newFormatterZone<icu::TimeZone>());
  return writer;
}

std::unique_ptr<DateReader> makeReader(std::string_view pattern) {
  UErrorCode status = U_ZERO_ERROR;
  auto reader = std::make_unique<DateReader>();
  reader->format = std::make_unique<icu::SimpleDateFormat>(unicode(pattern), gregorianLocale(), status);
  reader->calendar =
      std::make_unique<icu::GregorianCalendar>(newFormatterZone<icu::TimeZone>(), gregorianLocale(), status);
  if (U_FAILURE(status)) return nullptr;
  reader->format->setLenient(false);
  reader->format->set2DigitYearStart(kTwoDigitYearStart, status);
  reader->calendar->setLenient(false);
  return reader;
}

std::string written(const DateWriter* writer, double time) {
  if (writer == nullptr || !isFormattableTime(time)) return {};
  icu::UnicodeString text;
  writer->format->format(time * 1000.0, text);
  std::string date = utf8From({text.getBuffer(), static_cast<std::size_t>(text.length())});
  return asSpoken(writer->tellsTime ? withoutLeadingZeros(std::move(date)) : std::move(date));
}

using WeekdayNames = std::vector<std::string>;

WeekdayNames weekdayNames(icu::DateFormatSymbols::DtContextType context) {
  UErrorCode status = U_ZERO_ERROR;
  const icu::DateFormatSymbols symbols(gregorianLocale(), status);
  int32_t count = 0;
  const icu::UnicodeString* names = symbols.getWeekdays(count, context, icu::DateFormatSymbols::WIDE);
  WeekdayNames result;
  for (int32_t day = UCAL_SUNDAY; day < count; ++day) {
    result.push_back(utf8From({names[day].getBuffer(), static_cast<std::size_t>(names[day].length())}));
  }
  return result;
}

}  // namespace

std::string dateString(double time, std::string_view pattern) {
  return written(
      formatterCache().get<DateWriter>(FormatterKind::date, 0, pattern, [&] { return makeWriter(pattern); }),
      time);
}

std::string dateStyleString(double time, DateStyle style) {
  return written(formatterCache().get<DateWriter>(FormatterKind::dateStyle, static_cast<int32_t>(style), {},
                                                  [&] { return makeStyleWriter(style); }),
                 time);
}

std::optional<double> parseDate(std::string_view text, std::string_view pattern) {
  const DateReader* reader = formatterCache().get<DateReader>(FormatterKind::dateParser, 0, pattern,
                                                              [&] { return makeReader(pattern); });
  if (reader == nullptr || text.empty()) return std::nullopt;
  const icu::UnicodeString source = unicode(text);
  icu::ParsePosition position(0);
  reader->calendar->clear();
  reader->calendar->set(2000, UCAL_JANUARY, 1, 12, 0, 0);  // noon: some midnights do not exist
  reader->format->parse(source, *reader->calendar, position);
  if (position.getIndex() != source.length()) return std::nullopt;
  UErrorCode status = U_ZERO_ERROR;
  const double milliseconds = reader->calendar->getTime(status);
  if (U_FAILURE(status)) return std::nullopt;
  return milliseconds / 1000.0;
}

const std::vector<std::string>& weekdaySymbols() {
  static NeverDestroyed<PerRegion<WeekdayNames>> names;
  return names->get([] { return weekdayNames(icu::DateFormatSymbols::FORMAT); });
}

const std::vector<std::string>& standaloneWeekdaySymbols() {
  static NeverDestroyed<PerRegion<WeekdayNames>> names;
  return names->get([] { return weekdayNames(icu::DateFormatSymbols::STANDALONE); });
}

}  // namespace ax::formatting
