#include "bench/IcuFormats.h"

#include <unicode/dtptngen.h>
#include <unicode/timezone.h>

#include "platform/foundation/Environment.h"

namespace bench {

namespace {

icu::Locale locale() {
  return icu::Locale(ax::environment().locale.c_str());
}

icu::TimeZone* newZone() {
  return icu::TimeZone::createTimeZone(icu::UnicodeString::fromUTF8(ax::environment().timeZone));
}

std::string utf8(const icu::UnicodeString& text) {
  std::string result;
  text.toUTF8String(result);
  return result;
}

icu::number::LocalizedNumberFormatter numberFormatter() {
  return icu::number::NumberFormatter::withLocale(locale()).roundingMode(UNUM_ROUND_HALFUP);
}

}  // namespace

IcuIntervals::IcuIntervals(const char* skeleton) {
  UErrorCode status = U_ZERO_ERROR;
  format_.reset(icu::DateIntervalFormat::createInstance(skeleton, locale(), status));
  format_->adoptTimeZone(newZone());
}

std::string IcuIntervals::text(double start, double end) const {
  const icu::DateInterval interval(start * 1000, end * 1000);
  icu::UnicodeString text;
  icu::FieldPosition ignored(icu::FieldPosition::DONT_CARE);
  UErrorCode status = U_ZERO_ERROR;
  return utf8(format_->format(&interval, text, ignored, status));
}

IcuDates::IcuDates(const char* skeleton) {
  UErrorCode status = U_ZERO_ERROR;
  const std::unique_ptr<icu::DateTimePatternGenerator> patterns(
      icu::DateTimePatternGenerator::createInstance(locale(), status));
  format_ =
      std::make_unique<icu::SimpleDateFormat>(patterns->getBestPattern(skeleton, status), locale(), status);
  format_->adoptTimeZone(newZone());
}

std::string IcuDates::text(double time) const {
  icu::UnicodeString text;
  return utf8(format_->format(time * 1000, text));
}

IcuNumbers IcuNumbers::decimals(int most) {
  return IcuNumbers(numberFormatter().precision(icu::number::Precision::maxFraction(most)));
}

IcuNumbers IcuNumbers::percent() {
  return IcuNumbers(numberFormatter()
                        .unit(icu::MeasureUnit::getPercent())
                        .scale(icu::number::Scale::powerOfTen(2))
                        .precision(icu::number::Precision::integer()));
}

icu::UnicodeString IcuNumbers::wideText(double value) const {
  UErrorCode status = U_ZERO_ERROR;
  return formatter_.formatDouble(value, status).toString(status);
}

std::string IcuNumbers::text(double value) const {
  return utf8(wideText(value));
}

IcuMessage::IcuMessage(const std::string& pattern) {
  UErrorCode status = U_ZERO_ERROR;
  format_ = std::make_unique<icu::MessageFormat>(icu::UnicodeString::fromUTF8(pattern), locale(), status);
}

std::string IcuMessage::text(const icu::UnicodeString& argument) const {
  const icu::Formattable value(argument);
  icu::UnicodeString text;
  icu::FieldPosition ignored(icu::FieldPosition::DONT_CARE);
  UErrorCode status = U_ZERO_ERROR;
  return utf8(format_->format(&value, 1, text, ignored, status));
}

}  // namespace bench
