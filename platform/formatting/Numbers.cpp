#include "platform/formatting/Numbers.h"

#include <unicode/dcfmtsym.h>
#include <unicode/decimfmt.h>
#include <unicode/numberformatter.h>
#include <unicode/plurrule.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <memory>
#include <utility>

#include "platform/formatting/FormatterCache.h"
#include "platform/formatting/PlatformWords.h"
#include "platform/formatting/Region.h"
#include "platform/formatting/Text.h"

namespace ax::formatting {

using icu::number::FormattedNumber;

struct PluralOperands {
  FormattedNumber number;
};

namespace {

using icu::number::LocalizedNumberFormatter;
using icu::number::Precision;

// In bytes. Nobody shows a longer one, and reading it takes a time that grows with the square of its length.
constexpr std::size_t longestNumber = 1000;

struct NumberWriter final : CachedFormatter {
  explicit NumberWriter(LocalizedNumberFormatter made) : formatter(std::move(made)) {}
  LocalizedNumberFormatter formatter;
};

struct NumberReader final : CachedFormatter {
  explicit NumberReader(std::unique_ptr<icu::NumberFormat> made) : format(std::move(made)) {}
  std::unique_ptr<icu::NumberFormat> format;
};

// The region's own, but that the hyphen in a minus gives way to the sign itself.
icu::DecimalFormatSymbols symbolsOf(const icu::Locale& locale) {
  UErrorCode status = U_ZERO_ERROR;
  icu::DecimalFormatSymbols symbols(locale, status);
  icu::UnicodeString minus = symbols.getSymbol(icu::DecimalFormatSymbols::kMinusSignSymbol);
  minus.findAndReplace(u"-", u"\u2212");
  symbols.setSymbol(icu::DecimalFormatSymbols::kMinusSignSymbol, minus);
  return symbols;
}

LocalizedNumberFormatter baseFormatter() {
  const icu::Locale locale(currentRegion().locale.c_str());
  return icu::number::NumberFormatter::withLocale(locale)
      .symbols(symbolsOf(locale))
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

NumberText numberText(FormattedNumber number) {
  UErrorCode status = U_ZERO_ERROR;
  const icu::UnicodeString text = number.toTempString(status);
  if (U_FAILURE(status)) return {};
  return {utf8From({text.getBuffer(), static_cast<std::size_t>(text.length())}),
          std::make_shared<PluralOperands>(PluralOperands{std::move(number)})};
}

NumberText formatted(const LocalizedNumberFormatter& formatter, double value) {
  if (!std::isfinite(value)) return {noValueText(), nullptr, true, true};
  UErrorCode status = U_ZERO_ERROR;
  return numberText(formatter.formatDouble(value, status));
}

NumberText formatted(const LocalizedNumberFormatter& formatter, std::int64_t value) {
  UErrorCode status = U_ZERO_ERROR;
  return numberText(formatter.formatInt(value, status));
}

struct Plurals final : CachedFormatter {
  explicit Plurals(std::unique_ptr<icu::PluralRules> made) : rules(std::move(made)) {}
  std::unique_ptr<icu::PluralRules> rules;
};

std::unique_ptr<Plurals> makePlurals() {
  UErrorCode status = U_ZERO_ERROR;
  std::unique_ptr<icu::PluralRules> rules(
      icu::PluralRules::forLocale(icu::Locale(currentRegion().locale.c_str()), status));
  return U_FAILURE(status) ? nullptr : std::make_unique<Plurals>(std::move(rules));
}

constexpr std::array pluralKeywords = {u"zero", u"one", u"two", u"few", u"many", u"other"};

std::unique_ptr<NumberReader> makeReader() {
  UErrorCode status = U_ZERO_ERROR;
  std::unique_ptr<icu::NumberFormat> format(
      icu::NumberFormat::createInstance(icu::Locale(currentRegion().locale.c_str()), status));
  if (U_FAILURE(status)) return nullptr;
  format->setLenient(false);
  return std::make_unique<NumberReader>(std::move(format));
}

}  // namespace

NumberText decimalNumber(double value, int maximumFractionDigits) {
  return formatted(writerOf(FormatterKind::decimal, std::clamp(maximumFractionDigits, 0, 15)), value);
}

NumberText integerNumber(std::int64_t value) {
  return formatted(writerOf(FormatterKind::integer), value);
}

NumberText percentNumber(double fraction) {
  return formatted(writerOf(FormatterKind::percent), fraction);
}

std::string decimalString(double value, int maximumFractionDigits) {
  return decimalNumber(value, maximumFractionDigits).text;
}

std::string integerString(std::int64_t value) {
  return integerNumber(value).text;
}

std::string plainIntegerString(std::int64_t value) {
  return formatted(writerOf(FormatterKind::plainInteger), value).text;
}

std::string percentString(double fraction) {
  return percentNumber(fraction).text;
}

std::string noValueText() {
  return platformWord("no.value");
}

PluralForm pluralForm(const NumberText& number) {
  if (!number.operands) return PluralForm::other;
  const Plurals* plurals = formatterCache().get<Plurals>(FormatterKind::pluralRules, 0, {}, makePlurals);
  if (plurals == nullptr) return PluralForm::other;
  UErrorCode status = U_ZERO_ERROR;
  const icu::UnicodeString keyword = plurals->rules->select(number.operands->number, status);
  const auto found = std::ranges::find(pluralKeywords, keyword,
                                       [](const char16_t* word) { return icu::UnicodeString(word); });
  return found == pluralKeywords.end() ? PluralForm::other : PluralForm(found - pluralKeywords.begin());
}

bool isNegative(const NumberText& number) {
  if (!number.operands) return false;
  UErrorCode status = U_ZERO_ERROR;
  return number.operands->number.toDecimalNumber<std::string>(status).starts_with('-');
}

std::optional<double> parseNumber(std::string_view text) {
  const NumberReader* reader =
      formatterCache().get<NumberReader>(FormatterKind::numberParser, 0, {}, makeReader);
  if (reader == nullptr || text.empty() || text.size() > longestNumber) return std::nullopt;
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
