#pragma once

#include "platform/foundation/Date.h"
#include "platform/toolkit/Control.h"

namespace ax::host {

// A day that can be tapped, named by its number in the month.
class ActivityTappableDay : public Control {
 public:
  static Class& staticClass();

  const Ref<Date>& date() const { return date_; }
  void setDate(Ref<Date> date) { date_ = std::move(date); }

 protected:
  Ref<String> defaultLabel() override;
  // The day shows by its circle alone whether it is selected.
  Traits defaultTraits() override { return TraitButton; }

 private:
  Ref<Date> date_;
};

// A day of the week palette; the circle behind the selected one is full.
class WeekPaletteTappableDay : public ActivityTappableDay {
 public:
  static Class& staticClass();

  void layoutSubviews() override;
  // It stays below its weekday.
  bool changesSides() const override { return false; }

 private:
  Ref<Layer> circle_;
};

}  // namespace ax::host
