#pragma once

#include "platform/toolkit/Control.h"
#include "platform/toolkit/Label.h"

namespace ax::host {

// The header of a section that its button opens and closes. A tap anywhere on the header presses the button.
class CHWorkoutDetailExpandingHeaderView : public View {
 public:
  static Class& staticClass();

  void layoutSubviews() override;

 protected:
  bool activateByDefault() override;

 private:
  void _expandButtonTapped(Ref<Object> button);

  Ref<Label> titleLabel_;
  Ref<Button> expandButton_;
  bool expanded_ = false;
};

}  // namespace ax::host
