#include "bundle/core/Category.h"
#include "platform/accessibility/Notifications.h"
#include "platform/toolkit/Control.h"
#include "platform/toolkit/ScrollView.h"

namespace ax {

namespace {

constinit const Message<Ref<Object>()> axScrollView{"_axScrollView"};
constinit const Message<void()> axUpdateStateForDetailView{"_axUpdateStateForDetailView"};

// A page control in a cell with a chart: when it is adjusted, the chart turns to the page.
class VeltoUIPageControlAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.of("ChartDetailCell").exists();
    contract.of("ChartDetailCell").instanceVariable("_scrollview", "ScrollView");
    contract.of("CHWorkoutDetailHeartRateChartTableViewCell").exists();
    contract.of("CHWorkoutDetailHeartRateChartTableViewCell").instanceVariable("_scrollView", "ScrollView");
  }

  void accessibilityIncrement() {
    super(messages::accessibilityIncrement);
    axUpdateStateForDetailView(self);
  }

  void accessibilityDecrement() {
    super(messages::accessibilityDecrement);
    axUpdateStateForDetailView(self);
  }

  // The two kinds of cell name their scroll view differently.
  Ref<Object> _axScrollView() {
    if (const Ref<Object> cell = enclosing("ChartDetailCell"))
      return castAsClass<ScrollView>(cell->safeValueForKey("_scrollview"_key));
    if (const Ref<Object> cell = enclosing("CHWorkoutDetailHeartRateChartTableViewCell"))
      return castAsClass<ScrollView>(cell->safeValueForKey("_scrollView"_key));
    return nullptr;
  }

  void _axUpdateStateForDetailView() {
    const Ref<ScrollView> scrollView = cast<ScrollView>(axScrollView(self));
    const Ref<PageControl> pages = castAsClass<PageControl>(self);
    const std::int64_t page = messages::currentPage(pages);
    if (scrollView) {
      const double left = messages::bounds(scrollView).width * static_cast<double>(page);
      messages::setContentOffset(scrollView, {left, messages::contentOffset(scrollView).y});
    }
    messages::setCurrentPage(pages, page);
    postNotification(LayoutChangedNotification);
  }

 private:
  Ref<Object> enclosing(std::string_view className) {
    const Class* cellClass = safeClassFromString(className);
    return _accessibilityFindAncestor(
        self, [&](Object& object) { return object.isKindOf(cellClass); }, false);
  }
};

}  // namespace

AX_CATEGORY(VeltoUIPageControlAccessibility, "PageControl", overrides<&C::_axScrollView>(axScrollView),
            overrides<&C::_axUpdateStateForDetailView>(axUpdateStateForDetailView))

}  // namespace ax
