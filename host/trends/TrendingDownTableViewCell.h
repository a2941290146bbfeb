#pragma once

#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// A row with one downward trend and advice below it: "Velto.TrendingDownTableViewCell".
class TrendingDownTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  const Ref<View>& view() const { return view_; }
  void setView(Ref<View> view) { view_ = std::move(view); }
  const Ref<Label>& detailLabel() const { return detailLabel_; }
  void setDetailLabel(Ref<Label> label) { detailLabel_ = std::move(label); }
  void layoutSubviews() override;

 private:
  Ref<View> view_;
  Ref<Label> detailLabel_;
};

}  // namespace ax::host
