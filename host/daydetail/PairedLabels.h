#pragma once

#include "platform/toolkit/Label.h"

namespace ax::host {

// A key beside its value, such as "Total calories" and "2,100": "_PairedLabels".
class PairedLabels : public View {
 public:
  static Class& staticClass();

  const Ref<Label>& keyLabel() const { return keyLabel_; }
  void setKeyLabel(Ref<Label> label) { keyLabel_ = std::move(label); }
  const Ref<Label>& valueLabel() const { return valueLabel_; }
  void setValueLabel(Ref<Label> label) { valueLabel_ = std::move(label); }
  void layoutSubviews() override;

 private:
  Ref<Label> keyLabel_;
  Ref<Label> valueLabel_;
};

}  // namespace ax::host
