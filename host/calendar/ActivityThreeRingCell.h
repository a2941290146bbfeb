#pragma once

#include "platform/foundation/Date.h"
#include "platform/toolkit/Label.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// A day in the list of days: its rings over its date.
class ActivityThreeRingCell : public CollectionViewCell {
 public:
  static Class& staticClass();

  // Puts the date below the rings.
  void layoutSubviews() override;

 private:
  Ref<Label> dateLabel_;
  Ref<Date> date_;
};

}  // namespace ax::host
