#pragma once

#include <span>

#include "platform/foundation/Array.h"
#include "platform/foundation/Date.h"
#include "platform/foundation/String.h"
#include "platform/runtime/Number.h"

// Formatter objects as the bundle makes and sets them. They are cheap: the formatters proper are shared and
// kept by language, zone and template. Main thread only. All answer in the environment's language and zone.
namespace ax {

// Names the two styles that the bundle asks for.
enum class DateFormatterStyle { none = 0, medium = 2 };

class DateFormatter final : public Object {
 public:
  static Class& staticClass();

  void setDateStyle(DateFormatterStyle style) { style_ = style; }
  // Nil for no date; the empty text without a style.
  Ref<String> stringFromDate(const Ref<Date>& date) const;
  // Full names, Sunday first.
  Ref<Array> weekdaySymbols() const;
  Ref<Array> standaloneWeekdaySymbols() const;

 private:
  DateFormatterStyle style_ = DateFormatterStyle::none;
};

// Never shows a time of its own accord; the template says which fields stand in the text.
class DateIntervalFormatter final : public Object {
 public:
  static Class& staticClass();

  void setDateTemplate(std::string_view dateTemplate) { template_ = dateTemplate; }
  Ref<String> stringFromDateToDate(const Date& start, const Date& end) const;
  Ref<String> stringFromDateInterval(const DateInterval& interval) const;

 private:
  std::string template_;
};

class NumberFormatter final : public Object {
 public:
  static Class& staticClass();

  // Whole numbers without grouping, as the default settings have it.
  Ref<String> stringFromNumber(const Ref<Number>& number) const;
  // Nil for a text that is no number in the reader's notation.
  Ref<Number> numberFromString(const Ref<String>& text) const;
};

// How many decimals a number is written with.
enum class FloatFormat { whole, twoDecimals };

// The next four make a NumberString; what is no number, or has no end, becomes the platform's word for no
// value. Rounded half away from zero; two decimals are the most.
Ref<String> formatFloat(FloatFormat format, float value);
Ref<String> formatInteger(std::int64_t value);
// Without its fraction; a figure that no integer holds is the nearest that there is.
Ref<String> formatWhole(double value);
// 1.0 is one hundred percent, in whole percent.
Ref<String> formatFloatWithPercentage(float fraction);
// Hours, minutes and seconds in full words.
Ref<String> durationStringForDuration(TimeInterval seconds);
// What the value counts; hours are spoken as hours and minutes.
enum class TimeStringType { seconds, hours };
Ref<String> timeStringForType(TimeStringType type, double value);
// Nil for no date.
Ref<String> dateStringForFormat(const Ref<Date>& date, std::string_view pattern);
Ref<Date> dateFromStringWithFormat(const Ref<String>& text, std::string_view pattern);

// A localized pattern filled with arguments: Numbers and what the functions above wrote choose plural forms,
// units agree with their number, other objects go in by their text form, nil as nothing. A result that ends
// with a number is a NumberString itself. Nil for no pattern.
Ref<String> stringWithFormat(const Ref<String>& pattern, std::span<const Ref<Object>> arguments);
inline Ref<String> stringWithFormat(const Ref<String>& pattern,
                                    std::initializer_list<Ref<Object>> arguments) {
  return stringWithFormat(pattern, std::span(arguments.begin(), arguments.size()));
}

}  // namespace ax
