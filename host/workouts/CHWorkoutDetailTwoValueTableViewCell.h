#pragma once

#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// Two figures of a workout side by side, each under its title. A figure is given as a styled text, a plain
// text, a Quantity, a Date with its time of day, or a Workout, which stands for its duration; nil shows two
// dashes.
class CHWorkoutDetailTwoValueTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  void configureWithTitle1Value1(Ref<Object> title, Ref<Object> value);
  void configureWithTitle2Value2(Ref<Object> title, Ref<Object> value);

  // Titles wait for their figure, which configures the pair at once.
  const Ref<Object>& title1() const { return title1_; }
  void setTitle1(Ref<Object> title) { title1_ = std::move(title); }
  const Ref<Object>& title2() const { return title2_; }
  void setTitle2(Ref<Object> title) { title2_ = std::move(title); }
  const Ref<Object>& value1() const { return value1_; }
  void setValue1(Ref<Object> value);
  const Ref<Object>& value2() const { return value2_; }
  void setValue2(Ref<Object> value);
  void layoutSubviews() override;

 private:
  Ref<Object> title1_, value1_, title2_, value2_;
  Ref<Label> titleLabel1_, valueLabel1_, titleLabel2_, valueLabel2_;
};

}  // namespace ax::host
