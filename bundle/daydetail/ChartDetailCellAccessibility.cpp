#include "bundle/core/Category.h"
#include "platform/accessibility/Notifications.h"

namespace ax {

namespace {

constinit const Message<void(Ref<Object>)> addChartLabelWithUnit{"addChartLabelWithUnit:"};
constinit const Message<void()> axHideChartLabel{"_axHideChartLabel"};
constinit const Message<void()> axUpdateScrollViewInset{"_axUpdateScrollViewInset"};

// A ring's chart on a day's page: its unit is not spoken by itself, and what the figure covers of the chart
// does not count as visible.
class ChartDetailCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("chartLabel", {"@"});
    contract.instanceMethod("addChartLabelWithUnit:", {"v", "@"});
    contract.instanceMethod("layoutSubviews", {"v"});
    contract.instanceVariable("_value", "Label");
    contract.instanceVariable("_scrollview", "ScrollView");
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    axHideChartLabel(self);
    axUpdateScrollViewInset(self);
  }

  void addChartLabelWithUnit(Ref<Object> unit) {
    super(ax::addChartLabelWithUnit, unit);
    axHideChartLabel(self);
  }

  void layoutSubviews() {
    super(messages::layoutSubviews);
    axUpdateScrollViewInset(self);
  }

  void _axHideChartLabel() {
    messages::setIsAccessibilityElement(self.safeValueForKey("chartLabel"_key), false);
  }

  void _axUpdateScrollViewInset() {
    const Ref<Object> value = self.safeValueForKey("_value"_key);
    const Ref<Object> scrollView = self.safeValueForKey("_scrollview"_key);
    if (!value || !scrollView) return;
    const double inset =
        messages::accessibilityFrame(value).maxY() - messages::accessibilityFrame(scrollView).y;
    if (inset >= 0) {
      _accessibilitySetVisibleContentInset(scrollView, {.top = inset});
    } else {
      assertion(false, "Unexpected result computing inset for scroll view",
                "Accessibility/ChartDetailCellAccessibility", 52,
                "-[ChartDetailCellAccessibility _axUpdateScrollViewInset]");
    }
  }
};

}  // namespace

AX_CATEGORY(ChartDetailCellAccessibility, "ChartDetailCell",
            overrides<&C::addChartLabelWithUnit>(ax::addChartLabelWithUnit),
            overrides<&C::_axHideChartLabel>(axHideChartLabel),
            overrides<&C::_axUpdateScrollViewInset>(axUpdateScrollViewInset))

}  // namespace ax
