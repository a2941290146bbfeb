#include "platform/formatting/Durations.h"

#include <unicode/decimfmt.h>
#include <unicode/listformatter.h>
#include <unicode/numberformatter.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <memory>

#include "platform/formatting/FormatterCache.h"
#include "platform/formatting/Region.h"
#include "platform/formatting/Text.h"

namespace ax::formatting {
namespace {

using icu::number::LocalizedNumberFormatter;

constexpr double kLongestSeconds = 1e15;

struct DurationWriter final : CachedFormatter {
  std::array<LocalizedNumberFormatter, 3> units;  // hours, minutes, seconds
  std::unique_ptr<icu::ListFormatter> list;
  icu::UnicodeString minusSign;
};

std::unique_ptr<DurationWriter> makeWriter() {
  const icu::Locale locale(currentRegion().locale.c_str());
  UErrorCode status = U_ZERO_ERROR;
  auto writer = std::make_unique<DurationWriter>();
  const auto base = icu::number::NumberFormatter::withLocale(locale).unitWidth(UNUM_UNIT_WIDTH_FULL_NAME);
  writer->units = {base.unit(icu::MeasureUnit::getHour()), base.unit(icu::MeasureUnit::getMinute()),
                   base.unit(icu::MeasureUnit::getSecond())};
  writer->list.reset(
      icu::ListFormatter::createInstance(locale, ULISTFMT_TYPE_UNITS, ULISTFMT_WIDTH_WIDE, status));
  const icu::DecimalFormatSymbols symbols(locale, status);
  if (U_FAILURE(status)) return nullptr;
  writer->minusSign = symbols.getConstSymbol(icu::DecimalFormatSymbols::kMinusSignSymbol);
  return writer;
}

std::string spoken(std::int64_t wholeSeconds) {
  const DurationWriter* writer =
      formatterCache().get<DurationWriter>(FormatterKind::duration, 0, {}, makeWriter);
  if (writer == nullptr) return {};
  const std::int64_t length = std::abs(wholeSeconds);
  const std::array<std::int64_t, 3> amounts{length / 3600, length / 60 % 60, length % 60};
  std::array<icu::UnicodeString, 3> parts;
  int32_t count = 0;
  UErrorCode status = U_ZERO_ERROR;
  for (std::size_t i = 0; i < amounts.size(); ++i) {
    if (amounts[i] == 0 && !(length == 0 && i == 1)) continue;
    parts[count++] = writer->units[i].formatInt(amounts[i], status).toString(status);
  }
  icu::UnicodeString result;
  if (wholeSeconds < 0) result = writer->minusSign;
  if (count == 1) {
    result.append(parts[0]);
  } else {
    writer->list->format(parts.data(), count, result, status);
  }
  if (U_FAILURE(status)) return {};
  return utf8From({result.getBuffer(), static_cast<std::size_t>(result.length())});
}

std::int64_t wholeCount(double value, double longest) {
  if (!std::isfinite(value)) return 0;
  return std::llround(std::clamp(value, -longest, longest));
}

}  // namespace

std::string spokenDuration(double seconds) {
  return spoken(wholeCount(seconds, kLongestSeconds));
}

std::string spokenHours(double hours) {
  return spoken(60 * wholeCount(hours * 60, kLongestSeconds / 60));
}

}  // namespace ax::formatting
