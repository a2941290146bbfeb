#include "bundle/core/Category.h"
#include "platform/accessibility/Notifications.h"

namespace ax {

namespace {

const Message<void(Ref<Object>)> addChartLabelWithUnit{"addChartLabelWithUnit:"};
const Message<void()> axHideChartLabel{"_axHideChartLabel"};
const Message<void()> axUpdateScrollViewInset{"_axUpdateScrollViewInset"};

// A ring's chart on a day's page: its unit is not spoken by itself, and what the figure covers of the chart
// does not count as visible.
class ChartDetailCellAccessibility : public SafeCategory<ChartDetailCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "ChartDetailCell";
    manager.validateClassHasInstanceMethodWithFullSignature(target, "chartLabel", {"@"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "addChartLabelWithUnit:", {"v", "@"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "layoutSubviews", {"v"});
    manager.validateClassHasInstanceVariableWithType(target, "_value", "Label");
    manager.validateClassHasInstanceVariableWithType(target, "_scrollview", "ScrollView");
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

using C = ChartDetailCellAccessibility;

const CategoryRegistration<C> registration{
    "ChartDetailCellAccessibility",
    "ChartDetailCell",
    {overrides<&C::_accessibilityLoadAccessibilityInformation>(
         messages::_accessibilityLoadAccessibilityInformation),
     overrides<&C::addChartLabelWithUnit>(ax::addChartLabelWithUnit),
     overrides<&C::layoutSubviews>(messages::layoutSubviews),
     overrides<&C::_axHideChartLabel>(axHideChartLabel),
     overrides<&C::_axUpdateScrollViewInset>(axUpdateScrollViewInset)}};

}  // namespace

}  // namespace ax
