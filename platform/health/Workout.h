#pragma once

#include "platform/foundation/Date.h"
#include "platform/health/Quantity.h"

namespace ax {

// The app or device that recorded something.
class Source final : public Object {
 public:
  static Class& staticClass();

  const Ref<String>& name() const { return name_; }
  // Whether it is the maker's own watch, which needs no naming beside a record.
  bool _isNorvaleWatch() const { return isNorvaleWatch_; }

 private:
  Ref<String> name_;
  bool isNorvaleWatch_ = false;
};

class SourceRevision final : public Object {
 public:
  static Class& staticClass();

  const Ref<Source>& source() const { return source_; }

 private:
  Ref<Source> source_;
};

inline constexpr std::int64_t WorkoutActivityTypeCycling = 13;
// By a sport's name such as "running"; 0 for any that is not known.
std::int64_t workoutActivityTypeNamed(std::string_view sport);
// "other" for 0 and for numbers that stand for no sport.
std::string_view nameOfWorkoutActivityType(std::int64_t type);

class Workout final : public Object {
 public:
  static Class& staticClass();

  std::int64_t workoutActivityType() const { return activityType_; }
  const Ref<Date>& startDate() const { return startDate_; }
  const Ref<Date>& endDate() const { return endDate_; }
  const Ref<SourceRevision>& sourceRevision() const { return sourceRevision_; }
  double duration() const { return duration_; }  // seconds, pauses left out
  const Ref<Quantity>& totalDistance() const { return totalDistance_; }
  const Ref<Quantity>& totalEnergyBurned() const { return totalEnergyBurned_; }

 private:
  std::int64_t activityType_ = 0;
  double duration_ = 0;
  Ref<Date> startDate_;
  Ref<Date> endDate_;
  Ref<SourceRevision> sourceRevision_;
  Ref<Quantity> totalDistance_;
  Ref<Quantity> totalEnergyBurned_;
};

// One heart rate, measured at a date.
class HeartRateSummaryReading final : public Object {
 public:
  static Class& staticClass();

  HeartRateSummaryReading() = default;
  HeartRateSummaryReading(Ref<Date> date, Ref<Quantity> quantity)
      : date_(std::move(date)), quantity_(std::move(quantity)) {}

  const Ref<Date>& date() const { return date_; }
  const Ref<Quantity>& quantity() const { return quantity_; }

 private:
  Ref<Date> date_;
  Ref<Quantity> quantity_;
};

}  // namespace ax
