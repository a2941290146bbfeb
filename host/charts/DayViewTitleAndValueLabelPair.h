#pragma once

#include "platform/toolkit/Label.h"

namespace ax::host {

// A title over its value: "Velto.DayViewTitleAndValueLabelPair".
class DayViewTitleAndValueLabelPair : public View {
 public:
  static Class& staticClass();

  const Ref<Label>& titleLabel() const { return titleLabel_; }
  void setTitleLabel(Ref<Label> label) { titleLabel_ = std::move(label); }
  const Ref<Label>& valueLabel() const { return valueLabel_; }
  void setValueLabel(Ref<Label> label) { valueLabel_ = std::move(label); }

  void layoutSubviews() override;

 private:
  Ref<Label> titleLabel_;
  Ref<Label> valueLabel_;
};

}  // namespace ax::host
