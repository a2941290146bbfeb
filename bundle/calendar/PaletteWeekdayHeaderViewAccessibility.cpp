#include <algorithm>

#include "bundle/calendar/PaletteWeek.h"
#include "bundle/core/Category.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

constinit const Message<Ref<Object>(Ref<Object>)> initWithNavigationPalette{"initWithNavigationPalette:"};
constinit const Message<void(Ref<Object>)> highlightWeekdayLabel{"highlightWeekdayLabelForDateAndSetDay:"};

Key shownDateKey() {
  return "AXDate"_key;
}

// The seven weekday labels over the palette: each is named by its weekday, and its value is that day's rings.
// The host's labels are the elements; a set-up clears their values, and the next question fills them again.
class PaletteWeekdayHeaderViewAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_weekdayLabels", "MutableArray");
    contract.instanceMethod("highlightWeekdayLabelForDateAndSetDay:", {"v", "@"});
    contract.instanceMethod("layoutSubviews", {"v"});
  }

  Ref<Object> initWithNavigationPalette(Ref<Object> palette) {
    Ref<Object> header = super(ax::initWithNavigationPalette, palette);
    messages::_accessibilityLoadAccessibilityInformation(header);
    return header;
  }

  void layoutSubviews() {
    super(messages::layoutSubviews);
    messages::_accessibilityLoadAccessibilityInformation(self);
  }

  void highlightWeekdayLabelForDateAndSetDay(Ref<Object> date) {
    super(highlightWeekdayLabel, date);
    messages::_accessibilityLoadAccessibilityInformation(self);
    self._accessibilitySetRetainedValueForKey(date, shownDateKey());
  }

  void _accessibilityLoadAccessibilityInformation() {
    const PaletteWeekdays weekdays = PaletteWeekdays::current();
    if (const Ref<Array> elements = messages::accessibilityElements(self)) {
      for (std::size_t i = 0; i < elements->count(); ++i) setUp(*elements->at(i), i, weekdays);
    }
    super(messages::_accessibilityLoadAccessibilityInformation);
  }

  Ref<Array> accessibilityElements() {
    Ref<Array> labels = castAsClass<Array>(self.safeValueForKey("_weekdayLabels"_key));
    if (!labels) return nullptr;
    const bool lacksValue = std::any_of(labels->begin(), labels->end(), [](const Ref<Object>& label) {
      return !messages::accessibilityValue(label);
    });
    if (lacksValue) fillDayValues(*labels, *shownDate());
    return labels;
  }

  Ref<Object> _accessibilityHitTest(Point point, Ref<Object>) {
    const Ref<View> header = castAsClass<View>(self);
    const Ref<Array> elements = messages::accessibilityElements(self);
    return header && elements ? elements->at(sliceAt(point.x, messages::bounds(header).width)) : nullptr;
  }

 private:
  Ref<Date> shownDate() {
    Ref<Date> date = castAsClass<Date>(self._accessibilityValueForKey(shownDateKey()));
    return date ? date : Date::now();
  }

  void setUp(Object& element, std::size_t position, const PaletteWeekdays& weekdays) {
    messages::setAccessibilityContainer(element, Ref<Object>(&self));
    if (position >= weekdays.count()) return;
    messages::setAccessibilityLabel(element, weekdays.labelAt(position));
    messages::setAccessibilityValue(element, nullptr);
    messages::setIsAccessibilityElement(element, true);
    if (View* label = cast<View>(&element)) widen(*label);
  }

  // A label's frame becomes its seventh of the header.
  void widen(View& label) {
    const Ref<View> header = castAsClass<View>(self);
    if (!header) return;
    const Rect bounds = messages::bounds(header);
    const double width = bounds.width / daysOfWeek;
    const double height = bounds.height;
    if (!(width > 0 && height > 0)) return;
    const Rect seventh{messages::center(label).x - width * 0.5, messages::frame(label).y, width, height};
    messages::setAccessibilityFrame(label, convertFrameToScreenCoordinates(seventh, header));
  }
};

}  // namespace

AX_CATEGORY(PaletteWeekdayHeaderViewAccessibility, "PaletteWeekdayHeaderView",
            overrides<&C::initWithNavigationPalette>(ax::initWithNavigationPalette),
            overrides<&C::highlightWeekdayLabelForDateAndSetDay>(highlightWeekdayLabel))

}  // namespace ax
