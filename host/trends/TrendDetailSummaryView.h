#pragma once

#include "platform/toolkit/Label.h"

namespace ax::host {

// What a trend's own screen says: a heading, and the advice below it. "Velto.TrendDetailSummaryView".
class TrendDetailSummaryView : public View {
 public:
  static Class& staticClass();

  const Ref<Label>& titleLabel() const { return titleLabel_; }
  void setTitleLabel(Ref<Label> label) { titleLabel_ = std::move(label); }
  const Ref<Label>& summaryLabel() const { return summaryLabel_; }
  void setSummaryLabel(Ref<Label> label) { summaryLabel_ = std::move(label); }
  const Ref<Label>& coachingLabel() const { return coachingLabel_; }
  void setCoachingLabel(Ref<Label> label) { coachingLabel_ = std::move(label); }
  void layoutSubviews() override;

 private:
  Ref<Label> titleLabel_;
  Ref<Label> summaryLabel_;
  Ref<Label> coachingLabel_;
};

}  // namespace ax::host
