#include "platform/formatting/Numbers.h"

#include <unicode/decimfmt.h>
#include <unicode/numberformatter.h>

#include <algorithm>
#include <cmath>
#include <memory>
#include <utility>

#include "platform/formatting/FormatterCache.h"
#include "platform/formatting/Region.h"
#include "platform/formatting/Text.h"

namespace ax::formatting {
namespace {

using icu::number::FormattedNumber;
using icu::number::LocalizedNumberFormatter;
using icu::number::Precision;

struct NumberWriter final : CachedFormatter {
  explicit NumberWriter(LocalizedNumberFormatter made) : formatter(std::move(made)) {}
  LocalizedNumberFormatter formatter;
};

struct NumberReader final : CachedFormatter {
  explicit NumberReader(std::unique_ptr<icu::NumberFormat> made) : format(std::move(made)) {}
  std::unique_ptr<icu::NumberFormat> format;
};

LocalizedNumberFormatter baseFormatter() {
  return icu::number::NumberFormatter::withLocale(icu::Locale(currentRegion().locale.c_str()))
      .roundingMode(UNUM_ROUND_HALFUP)
      .sign(UNUM_SIGN_NEGATIVE);
}

LocalizedNumberFormatter formatterOf(FormatterKind kind, int fractionDigits) {
  switch (kind) {
    case FormatterKind::percent:
      return baseFormatter()
          .unit(icu::MeasureUnit::getPercent())
          .scale(icu::number::Scale::powerOfTen(2))
          .precision(Precision::integer());
    case FormatterKind::plainInteger:
      return baseFormatter().grouping(UNUM_GROUPING_OFF);
    default:
      return baseFormatter().precision(Precision::maxFraction(fractionDigits));
  }
}

const LocalizedNumberFormatter& writerOf(FormatterKind kind, int fractionDigits = 0) {
  return formatterCache()
      .get<NumberWriter>(kind, fractionDigits, {},
                         [&] { return std::make_unique<NumberWriter>(formatterOf(kind, fractionDigits)); })
      ->formatter;
}

std::string textOf(const FormattedNumber& number) {
  UErrorCode status = U_ZERO_ERROR;
  const icu::UnicodeString text = number.toTempString(status);
  if (U_FAILURE(status)) return {};
  return utf8From({text.getBuffer(), static_cast<std::size_t>(text.length())});
}

std::string formatted(const LocalizedNumberFormatter& formatter, double value) {
  UErrorCode status = U_ZERO_ERROR;
  return textOf(formatter.formatDouble(value, status));
}

std::string formatted(const LocalizedNumberFormatter& formatter, std::int64_t value) {
  UErrorCode status = U_ZERO_ERROR;
  return textOf(formatter.formatInt(value, status));
}

std::unique_ptr<NumberReader> makeReader() {
  UErrorCode status = U_ZERO_ERROR;
  std::unique_ptr<icu::NumberFormat> format(
      icu::NumberFormat::createInstance(icu::Locale(currentRegion().locale.c_str()), status));
  if (U_FAILURE(status)) return nullptr;
  format->setLenient(false);
  return std::make_unique<NumberReader>(std::move(format));
}

}  // namespace

std::string decimalString(double value, int maximumFractionDigits) {
  return formatted(writerOf(FormatterKind::decimal, std::clamp(maximumFractionDigits, 0, 15)), value);
}

std::string integerString(std::int64_t value) {
  return formatted(writerOf(FormatterKind::integer), value);
}

std::string plainIntegerString(std::int64_t value) {
  return formatted(writerOf(FormatterKind::plainInteger), value);
}

std::string percentString(double fraction) {
  return formatted(writerOf(FormatterKind::percent), fraction);
}

std::optional<double> parseNumber(std::string_view text) {
  const NumberReader* reader =
      formatterCache().get<NumberReader>(FormatterKind::numberParser, 0, {}, makeReader);
  if (reader == nullptr || text.empty()) return std::nullopt;
  const std::u16string wide = utf16From(text);
  const icu::UnicodeString source(false, wide.c_str(), static_cast<int32_t>(wide.size()));
  icu::Formattable result;
  icu::ParsePosition position(0);
  reader->format->parse(source, result, position);
  if (position.getIndex() != source.length()) return std::nullopt;
  UErrorCode status = U_ZERO_ERROR;
  const double value = result.getDouble(status);
  if (U_FAILURE(status) || !std::isfinite(value)) return std::nullopt;
  return value;
}

}  // namespace ax::formatting
