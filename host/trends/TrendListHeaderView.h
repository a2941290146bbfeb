#pragma once

#include "platform/toolkit/Label.h"

namespace ax::host {

// The heading of a list of trends, over a link to what trends are: "Velto.TrendListHeaderView".
class TrendListHeaderView : public View {
 public:
  static Class& staticClass();

  const Ref<Label>& titleLabel() const { return titleLabel_; }
  void setTitleLabel(Ref<Label> label) { titleLabel_ = std::move(label); }
  const Ref<View>& linkView() const { return linkView_; }
  void setLinkView(Ref<View> view) { linkView_ = std::move(view); }
  void layoutSubviews() override;

 private:
  Ref<Label> titleLabel_;
  Ref<View> linkView_;
};

}  // namespace ax::host
