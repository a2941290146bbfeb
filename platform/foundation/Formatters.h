#pragma once

#include <span>

#include "platform/foundation/Array.h"
#include "platform/foundation/Date.h"
#include "platform/foundation/Number.h"
#include "platform/foundation/String.h"

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

// The next four make a NumberString; what is no number, or has no end, becomes the platform's word for no
// value. option 0: rounded half away from zero to a whole number; option 1: at most two decimals.
Ref<String> formatFloat(int option, float value);
Ref<String> formatInteger(std::int64_t value);
// Without its fraction; a figure that no integer holds is the nearest that there is.
Ref<String> formatWhole(double value);
// 1.0 is one hundred percent; option 0 is whole percent.
Ref<String> formatFloatWithPercentage(float fraction, int option);
// Hours, minutes and seconds in full words.
Ref<String> durationStringForDuration(TimeInterval seconds);
// Type 3: the value counts hours, spoken as hours and minutes. Every other type: the value counts seconds.
Ref<String> timeStringForType(int type, double value);
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
