#pragma once

#include "platform/runtime/Object.h"

namespace ax {

using TimeInterval = double;  // seconds

// A point in time.
class Date final : public Object {
 public:
  static Class& staticClass();

  explicit Date(double secondsSince1970) : time_(secondsSince1970) {}
  // The environment's current time.
  static Ref<Date> now();

  double timeIntervalSince1970() const { return time_; }
  TimeInterval timeIntervalSinceDate(const Date& other) const { return time_ - other.time_; }
  Ref<Date> dateByAddingTimeInterval(TimeInterval seconds) const;

  bool isEqual(const Object& other) const override;
  std::string description() const override;

 private:
  double time_;
};

inline Ref<Date> date(double secondsSince1970) {
  return make<Date>(secondsSince1970);
}

// A span of time between two dates, both included.
class DateInterval final : public Object {
 public:
  static Class& staticClass();

  DateInterval(Ref<Date> start, Ref<Date> end) : start_(std::move(start)), end_(std::move(end)) {}

  const Ref<Date>& startDate() const { return start_; }
  const Ref<Date>& endDate() const { return end_; }
  TimeInterval duration() const { return end_->timeIntervalSinceDate(*start_); }
  bool containsDate(const Date& date) const;

  bool isEqual(const Object& other) const override;
  std::string description() const override;

 private:
  Ref<Date> start_;
  Ref<Date> end_;
};

}  // namespace ax
