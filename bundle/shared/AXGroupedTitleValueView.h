#pragma once

#include "platform/toolkit/AccessibilityElement.h"

namespace ax {

// One stop for a caption and a figure that the host shows as two labels: the caption is its label, the figure
// its value, both read anew at each query. It retains the two views; either may be nil, and one that is the
// container, which owns it, counts as nil. Unless both speak, it is no element.
class AXGroupedTitleValueView final : public AggregateElement {
 public:
  static Class& staticClass();
  static Ref<AXGroupedTitleValueView> initWithAccessibilityContainerTitleViewValueView(Receiver container,
                                                                                       Ref<Object> titleView,
                                                                                       Ref<Object> valueView);

  AXGroupedTitleValueView(Receiver container, Ref<Object> titleView, Ref<Object> valueView);

 private:
  bool isAccessibilityElement();
  Ref<String> accessibilityLabel();
  Ref<String> accessibilityValue();

  Ref<Object> titleView_;
  Ref<Object> valueView_;
};

}  // namespace ax
