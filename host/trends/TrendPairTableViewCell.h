#pragma once

#include "platform/toolkit/Control.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// A row of two trends, each below a button that opens it: "Velto.TrendPairTableViewCell".
class TrendPairTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  const Ref<View>& leadingView() const { return leadingView_; }
  void setLeadingView(Ref<View> view) { leadingView_ = std::move(view); }
  const Ref<View>& trailingView() const { return trailingView_; }
  void setTrailingView(Ref<View> view) { trailingView_ = std::move(view); }
  const Ref<Button>& leadingButton() const { return leadingButton_; }
  void setLeadingButton(Ref<Button> button) { leadingButton_ = std::move(button); }
  const Ref<Button>& trailingButton() const { return trailingButton_; }
  void setTrailingButton(Ref<Button> button) { trailingButton_ = std::move(button); }
  void layoutSubviews() override;

 private:
  Ref<View> leadingView_;
  Ref<View> trailingView_;
  Ref<Button> leadingButton_;
  Ref<Button> trailingButton_;
};

}  // namespace ax::host
