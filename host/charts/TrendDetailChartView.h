#pragma once

#include "platform/foundation/Array.h"
#include "platform/foundation/Date.h"
#include "platform/health/Quantity.h"
#include "platform/toolkit/Label.h"

namespace ax::host {

// One bar of a trend: "Velto.TrendBar". A stretch of days without data has no quantity.
class TrendBar : public Object {
 public:
  static Class& staticClass();

  const Ref<DateInterval>& dateInterval() const { return dateInterval_; }
  const Ref<Quantity>& quantity() const { return quantity_; }

 private:
  Ref<DateInterval> dateInterval_;
  Ref<Quantity> quantity_;
};

// The bars of a trend under its title, with a label that names the top of the scale:
// "Velto.TrendDetailChartView". Asked for a bar that it does not have, it raises.
class TrendDetailChartView : public View {
 public:
  static Class& staticClass();

  const Ref<Label>& titleLabel() const { return titleLabel_; }
  void setTitleLabel(Ref<Label> label) { titleLabel_ = std::move(label); }
  const Ref<Label>& chartMaxLabel() const { return chartMaxLabel_; }
  void setChartMaxLabel(Ref<Label> label) { chartMaxLabel_ = std::move(label); }
  const Ref<Unit>& accessibilityUnit() const { return unit_; }
  void setAccessibilityUnit(Ref<Unit> unit) { unit_ = std::move(unit); }
  // Where the bars stand. Spread over the width at the next layout unless they have been set.
  const Ref<Array>& barStops() const { return barStops_; }
  void setBarStops(Ref<Array> stops) { barStops_ = std::move(stops); }

  void layoutSubviews() override;

 private:
  const TrendBar& barAt(std::int32_t index) const;
  Ref<Quantity> accessibilityQuantityForIndex(std::int32_t index) { return barAt(index).quantity(); }
  Ref<DateInterval> accessibilityDateIntervalForIndex(std::int32_t index) {
    return barAt(index).dateInterval();
  }

  Ref<Label> titleLabel_;
  Ref<Label> chartMaxLabel_;
  Ref<Unit> unit_;
  Ref<Array> bars_;
  Ref<Array> barStops_;
};

}  // namespace ax::host
