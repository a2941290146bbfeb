#pragma once

#include "platform/foundation/Date.h"
#include "platform/toolkit/Label.h"

namespace ax::host {

// The row of weekday initials over the week palette, in the order of the weekly goals.
class PaletteWeekdayHeaderView : public View {
 public:
  static Class& staticClass();

  // Makes the seven labels, for a palette that is not kept. The result is the header itself.
  Ref<Object> initWithNavigationPalette(Ref<Object> palette);
  // Makes the label of the date's weekday stand out.
  void highlightWeekdayLabelForDateAndSetDay(Ref<Object> date);
  // Puts the labels that have no superview into equal columns.
  void layoutSubviews() override;
  // A touch is counted from the left in every language, and so are the columns.
  bool changesSides() const override { return false; }

 private:
  Ref<MutableArray> weekdayLabels_;
};

}  // namespace ax::host
