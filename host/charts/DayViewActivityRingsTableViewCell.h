#pragma once

#include "host/charts/ARUIRingsView.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// The day's row with the rings: "Velto.DayViewActivityRingsTableViewCell".
class DayViewActivityRingsTableViewCell : public TableViewCell {
 public:
  static Class& staticClass();

  void layoutSubviews() override;

 private:
  Ref<ARUIRingsView> ringsView_;
};

}  // namespace ax::host
