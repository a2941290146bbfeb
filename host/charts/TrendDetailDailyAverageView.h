#pragma once

#include "platform/foundation/Array.h"
#include "platform/health/Quantity.h"
#include "platform/runtime/Number.h"
#include "platform/toolkit/Label.h"

namespace ax::host {

// The averages of one day of the week: "Velto.TrendDayAverage". Weekdays count from 1, a Sunday.
class TrendDayAverage : public Object {
 public:
  static Class& staticClass();

  const Ref<Number>& weekday() const { return weekday_; }
  const Ref<Quantity>& average365() const { return average365_; }
  const Ref<Quantity>& average90() const { return average90_; }

 private:
  Ref<Number> weekday_;
  Ref<Quantity> average365_;
  Ref<Quantity> average90_;
};

// A trend by day of the week, each day with its average over a year and over the last 90 days:
// "Velto.TrendDetailDailyAverageView". Asked for a day that it does not have, it raises.
class TrendDetailDailyAverageView : public View {
 public:
  static Class& staticClass();

  const Ref<Label>& titleLabel() const { return titleLabel_; }
  void setTitleLabel(Ref<Label> label) { titleLabel_ = std::move(label); }
  const Ref<Unit>& accessibilityUnit() const { return unit_; }
  void setAccessibilityUnit(Ref<Unit> unit) { unit_ = std::move(unit); }
  // Where the days stand. Spread over the width at the next layout unless they have been set.
  const Ref<Array>& dayStops() const { return dayStops_; }
  void setDayStops(Ref<Array> stops) { dayStops_ = std::move(stops); }

  void layoutSubviews() override;

 private:
  const TrendDayAverage& dayAt(std::int32_t index) const;
  Ref<Number> accessibilityDayForStopIndex(std::int32_t index) { return dayAt(index).weekday(); }
  Ref<Quantity> quantity365ForIndex(std::int32_t index) { return dayAt(index).average365(); }
  Ref<Quantity> quantity90ForIndex(std::int32_t index) { return dayAt(index).average90(); }

  Ref<Label> titleLabel_;
  Ref<Unit> unit_;
  Ref<Array> days_;
  Ref<Array> dayStops_;
};

}  // namespace ax::host
