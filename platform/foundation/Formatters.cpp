#include "platform/foundation/Formatters.h"

#include <cmath>

#include "platform/base/NeverDestroyed.h"
#include "platform/formatting/DateIntervals.h"
#include "platform/formatting/Dates.h"
#include "platform/formatting/Durations.h"
#include "platform/formatting/MessagePattern.h"
#include "platform/formatting/Numbers.h"
#include "platform/foundation/NumberString.h"
#include "platform/foundation/PercentTexts.h"
#include "platform/foundation/UnitName.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

Ref<Array> strings(const std::vector<std::string>& texts) {
  Array::Items items;
  for (const std::string& text : texts) items.push_back(string(text));
  return array(std::move(items));
}

formatting::MessageArgument numberArgument(const Number& number) {
  return std::visit(
      [](auto value) -> formatting::MessageArgument {
        if constexpr (std::is_floating_point_v<decltype(value)>) {
          return static_cast<double>(value);
        } else {
          return static_cast<std::int64_t>(value);
        }
      },
      number.content());
}

formatting::MessageArgument messageArgument(const Ref<Object>& object) {
  if (!object) return std::string();
  if (const auto* number = cast<Number>(object.get())) return numberArgument(*number);
  if (const auto* written = cast<NumberString>(object.get())) return written->number();
  if (const Ref<String> pattern = messages::countedPattern(object)) {
    return formatting::CountedNoun{object->description(), pattern->text()};
  }
  return object->description();
}

Ref<String> numberString(formatting::NumberText number) {
  return make<NumberString>(std::move(number));
}

// The text that says a value, or no value where there is none.
Ref<String> unlessNone(double value, std::string text) {
  return std::isfinite(value) ? string(std::move(text)) : numberString(formatting::decimalNumber(value, 0));
}

}  // namespace

Class& DateFormatter::staticClass() {
  static Class& result = ClassBuilder<DateFormatter>("DateFormatter", Object::staticClass()).build();
  return result;
}

Ref<String> DateFormatter::stringFromDate(const Ref<Date>& date) const {
  if (!date) return nullptr;
  if (style_ == DateFormatterStyle::none) return emptyString();
  return string(
      formatting::dateStyleString(date->timeIntervalSince1970(), formatting::DateStyle(int(style_))));
}

Ref<Array> DateFormatter::weekdaySymbols() const {
  return strings(formatting::weekdaySymbols());
}
Ref<Array> DateFormatter::standaloneWeekdaySymbols() const {
  return strings(formatting::standaloneWeekdaySymbols());
}

Class& DateIntervalFormatter::staticClass() {
  static Class& result =
      ClassBuilder<DateIntervalFormatter>("DateIntervalFormatter", Object::staticClass()).build();
  return result;
}

Ref<String> DateIntervalFormatter::stringFromDateToDate(const Date& start, const Date& end) const {
  return string(
      formatting::dateIntervalString(start.timeIntervalSince1970(), end.timeIntervalSince1970(), template_));
}

Ref<String> DateIntervalFormatter::stringFromDateInterval(const DateInterval& interval) const {
  return stringFromDateToDate(*interval.startDate(), *interval.endDate());
}

Class& NumberFormatter::staticClass() {
  static Class& result = ClassBuilder<NumberFormatter>("NumberFormatter", Object::staticClass()).build();
  return result;
}

Ref<String> NumberFormatter::stringFromNumber(const Ref<Number>& number) const {
  if (!number) return nullptr;
  return unlessNone(number->doubleValue(), formatting::plainIntegerString(number->int64Value()));
}

Ref<Number> NumberFormatter::numberFromString(const Ref<String>& text) const {
  if (!text) return nullptr;
  const std::optional<double> value = formatting::parseNumber(text->text());
  return value ? number(*value) : nullptr;
}

Ref<String> formatFloat(FloatFormat format, float value) {
  return numberString(formatting::decimalNumber(value, format == FloatFormat::whole ? 0 : 2));
}

Ref<String> formatInteger(std::int64_t value) {
  return numberString(formatting::integerNumber(value));
}

Ref<String> formatWhole(double value) {
  return std::isfinite(value) ? formatInteger(number(value)->int64Value())
                              : formatFloat(FloatFormat::whole, static_cast<float>(value));
}

Ref<String> formatFloatWithPercentage(float fraction) {
  static NeverDestroyed<PercentTexts> texts;
  return texts->text(fraction,
                     [](double written) { return numberString(formatting::percentNumber(written)); });
}

Ref<String> durationStringForDuration(TimeInterval seconds) {
  return unlessNone(seconds, formatting::spokenDuration(seconds));
}

Ref<String> timeStringForType(TimeStringType type, double value) {
  return unlessNone(value, type == TimeStringType::hours ? formatting::spokenHours(value)
                                                         : formatting::spokenDuration(value));
}

Ref<String> dateStringForFormat(const Ref<Date>& date, std::string_view pattern) {
  return date ? string(formatting::dateString(date->timeIntervalSince1970(), pattern)) : nullptr;
}

Ref<Date> dateFromStringWithFormat(const Ref<String>& text, std::string_view pattern) {
  if (!text) return nullptr;
  const std::optional<double> time = formatting::parseDate(text->text(), pattern);
  return time ? date(*time) : nullptr;
}

Ref<String> stringWithFormat(const Ref<String>& pattern, std::span<const Ref<Object>> arguments) {
  if (!pattern) return nullptr;
  std::vector<formatting::MessageArgument> filled;
  for (const Ref<Object>& argument : arguments) filled.push_back(messageArgument(argument));
  formatting::NumberText text = formatting::filledMessage(pattern->text(), filled);
  return text.operands || text.isNoValue ? numberString(std::move(text)) : string(std::move(text.text));
}

static const RegisteredClass<DateFormatter> registeredDate;
static const RegisteredClass<DateIntervalFormatter> registeredInterval;
static const RegisteredClass<NumberFormatter> registeredNumber;

}  // namespace ax
