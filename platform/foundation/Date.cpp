#include "platform/foundation/Date.h"

#include <chrono>

#include "platform/formatting/IsoTime.h"
#include "platform/foundation/Environment.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax {

Class& Date::staticClass() {
  static Class& result = ClassBuilder<Date>("Date", Object::staticClass())
                             .method<&Date::timeIntervalSince1970>("timeIntervalSince1970")
                             .build();
  return result;
}

Ref<Date> Date::now() {
  if (environment().now) return date(*environment().now);
  const auto sinceEpoch = std::chrono::system_clock::now().time_since_epoch();
  return date(std::chrono::duration<double>(sinceEpoch).count());
}

Ref<Date> Date::dateByAddingTimeInterval(TimeInterval seconds) const {
  return date(time_ + seconds);
}

bool Date::isEqual(const Object& other) const {
  const Date* date = cast<Date>(&other);
  return date != nullptr && date->time_ == time_;
}

std::string Date::description() const {
  return formatting::isoWithOffset(time_);
}

Class& DateInterval::staticClass() {
  static Class& result = ClassBuilder<DateInterval>("DateInterval", Object::staticClass())
                             .method<&DateInterval::startDate>("startDate")
                             .method<&DateInterval::endDate>("endDate")
                             .method<&DateInterval::duration>("duration")
                             .build();
  return result;
}

bool DateInterval::containsDate(const Date& date) const {
  const double time = date.timeIntervalSince1970();
  return start_->timeIntervalSince1970() <= time && time <= end_->timeIntervalSince1970();
}

bool DateInterval::isEqual(const Object& other) const {
  const DateInterval* interval = cast<DateInterval>(&other);
  return interval != nullptr && interval->start_->isEqual(*start_) && interval->end_->isEqual(*end_);
}

std::string DateInterval::description() const {
  return start_->description() + "/" + end_->description();
}

static const RegisteredClass<Date> registered;
static const RegisteredClass<DateInterval> registeredInterval;

}  // namespace ax
