#pragma once

#include "platform/toolkit/Label.h"

namespace ax::host {

// A titled figure with a tab for its total and one for its average: "_CHWorkoutSummaryTabbedLabelContainer".
// It shows the total first.
class CHWorkoutSummaryTabbedLabelContainer : public View {
 public:
  static Class& staticClass();

  // Any of them may be nil.
  void show(Ref<String> title, Ref<String> total, Ref<String> average);
  void layoutSubviews() override;

 private:
  Ref<String> titleText_;
  Ref<String> totalText_;
  Ref<String> averageText_;
  Ref<Label> titleLabel_;
  Ref<Label> figureLabel_;
};

}  // namespace ax::host
