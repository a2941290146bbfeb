#include "platform/foundation/Formatters.h"

#include "platform/formatting/DateIntervals.h"
#include "platform/formatting/Dates.h"
#include "platform/formatting/Durations.h"
#include "platform/formatting/MessagePattern.h"
#include "platform/formatting/Numbers.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

Ref<Array> strings(const std::vector<std::string>& texts) {
  Array::Items items;
  for (const std::string& text : texts) items.push_back(string(text));
  return array(std::move(items));
}

formatting::MessageArgument messageArgument(const Ref<Object>& object) {
  if (!object) return std::string();
  const Number* number = cast<Number>(object.get());
  if (number == nullptr) return object->description();
  return std::visit(
      [](auto value) -> formatting::MessageArgument {
        if constexpr (std::is_floating_point_v<decltype(value)>) {
          return static_cast<double>(value);
        } else {
          return static_cast<std::int64_t>(value);
        }
      },
      number->content());
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
  return number ? string(formatting::plainIntegerString(number->int64Value())) : nullptr;
}

Ref<Number> NumberFormatter::numberFromString(const Ref<String>& text) const {
  if (!text) return nullptr;
  const std::optional<double> value = formatting::parseNumber(text->text());
  return value ? number(*value) : nullptr;
}

Ref<String> formatFloat(int option, float value) {
  return string(formatting::decimalString(value, option == 0 ? 0 : 2));
}

Ref<String> formatInteger(std::int64_t value) {
  return string(formatting::integerString(value));
}

Ref<String> formatFloatWithPercentage(float fraction, int) {
  return string(formatting::percentString(fraction));
}

Ref<String> durationStringForDuration(TimeInterval seconds) {
  return string(formatting::spokenDuration(seconds));
}

Ref<String> timeStringForType(int type, double value) {
  return string(type == 3 ? formatting::spokenHours(value) : formatting::spokenDuration(value));
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
  return string(formatting::formatMessage(pattern->text(), filled));
}

static const RegisteredClass<DateFormatter> registeredDate;
static const RegisteredClass<DateIntervalFormatter> registeredInterval;
static const RegisteredClass<NumberFormatter> registeredNumber;

}  // namespace ax
