#pragma once

#include "platform/toolkit/Label.h"

namespace ax::host {

// One measure: its title over its value, and an arrow for its trend, which has words but shows none.
// "Velto.TrendListMetricView".
class TrendListMetricView : public View {
 public:
  static Class& staticClass();

  const Ref<Label>& titleLabel() const { return titleLabel_; }
  void setTitleLabel(Ref<Label> label) { titleLabel_ = std::move(label); }
  const Ref<Label>& valueLabel() const { return valueLabel_; }
  void setValueLabel(Ref<Label> label) { valueLabel_ = std::move(label); }
  const Ref<String>& trendString() const { return trendString_; }
  void setTrendString(Ref<String> text) { trendString_ = std::move(text); }
  void layoutSubviews() override;

 private:
  Ref<Label> titleLabel_;
  Ref<Label> valueLabel_;
  Ref<String> trendString_;
};

}  // namespace ax::host
