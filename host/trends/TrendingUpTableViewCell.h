#pragma once

#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// A row of one or two upward trends: "Velto.TrendingUpTableViewCell".
class TrendingUpTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  const Ref<View>& leadingView() const { return leadingView_; }
  void setLeadingView(Ref<View> view) { leadingView_ = std::move(view); }
  const Ref<View>& trailingView() const { return trailingView_; }
  void setTrailingView(Ref<View> view) { trailingView_ = std::move(view); }
  void layoutSubviews() override;

 private:
  Ref<View> leadingView_;
  Ref<View> trailingView_;
};

}  // namespace ax::host
