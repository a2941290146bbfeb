#include "bundle/core/Category.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

// A week of the month: its title, its goal texts while they show, and its days.
class MonthWeekViewAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.of("QSCalendarWeekView").instanceMethod("monthTitleView", {"@"});
    contract.isKindOf("QSCalendarWeekView");
    contract.instanceVariable("_goalPercentChangeTextLabel", "Label");
    contract.instanceVariable("_goalTextLabel", "Label");
    contract.instanceVariable("_topBorderLineOnDrag", "Layer");
  }

  Ref<Array> accessibilityElements() {
    const Array::Items days = takeDays();
    Array::Items elements;
    if (Ref<Object> title = self.safeValueForKey("monthTitleView"_key)) elements.push_back(std::move(title));
    const bool showsGoals = isTopBorderVisible();
    for (const Key key : {"_goalTextLabel"_key, "_goalPercentChangeTextLabel"_key}) {
      if (Ref<Object> goal = goalText(key, showsGoals)) elements.push_back(std::move(goal));
    }
    elements.insert(elements.end(), days.begin(), days.end());
    return sortedByGeometry(*array(std::move(elements)));
  }

 private:
  Array::Items takeDays() {
    Array::Items days;
    const Ref<View> row = castAsClass<View>(self);
    const Ref<Array> layers = messages::sublayers(messages::layer(row));
    if (!layers) return days;
    const Class* dayClass = safeClassFromString("MonthDayCellLayer"_key);
    for (const Ref<Object>& layer : *layers) {
      if (!layer->isKindOf(dayClass)) continue;
      messages::setAccessibilityContainer(layer, row);
      days.push_back(layer);
    }
    return days;
  }

  bool isTopBorderVisible() {
    const Ref<Layer> border = castAsClass<Layer>(self.safeValueForKey("_topBorderLineOnDrag"_key));
    return messages::opacity(border) > 0;
  }

  // The label under a key when there is something to say; nil, and no stop, when there is not.
  Ref<Object> goalText(Key key, bool shows) {
    Ref<Object> label = self.safeValueForKey(key);
    const bool speaks = shows && !isEmpty(messages::accessibilityLabel(label));
    messages::setIsAccessibilityElement(label, speaks);
    if (!speaks) return nullptr;
    messages::setAccessibilityContainer(label, Ref<Object>(&self));
    return label;
  }
};

}  // namespace

AX_CATEGORY(MonthWeekViewAccessibility, "MonthWeekView")

}  // namespace ax
