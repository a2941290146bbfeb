#pragma once

#include "platform/toolkit/Label.h"

namespace ax::host {

// The title over a group of badges.
class CHAchievementsSectionHeaderView : public View {
 public:
  static Class& staticClass();

  const Ref<Label>& label() const { return label_; }
  void setLabel(Ref<Label> label) { label_ = std::move(label); }
  void layoutSubviews() override;

 private:
  Ref<Label> label_;
};

}  // namespace ax::host
