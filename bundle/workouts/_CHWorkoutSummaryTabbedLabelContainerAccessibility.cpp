#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"
#include "bundle/workouts/SummaryLabelAttribute.h"
#include "platform/foundation/AttributedString.h"
#include "platform/runtime/Number.h"

namespace ax {

namespace {

const char labelAttributeKey = 0;

// A titled figure of a summary with its total and its average, in one element.
class CHWorkoutSummaryTabbedLabelContainerAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_titleText", "String");
    contract.instanceVariable("_totalText", "String");
    contract.instanceVariable("_averageText", "String");
  }

  bool isAccessibilityElement() { return true; }

  Ref<String> accessibilityLabel() {
    const Ref<MutableArray> parts = make<MutableArray>();
    const Ref<String> title = castAsClass<String>(self.safeValueForKey("_titleText"_key));
    if (!isEmpty(title)) parts->axSafelyAddObject(title);
    const Ref<String> attribute = messages::_accessibilityLabelAttribute(self);
    addFigure(*parts, "summary.cell.header.total", self.safeValueForKey("_totalText"_key), attribute);
    addFigure(*parts, "summary.cell.header.average", self.safeValueForKey("_averageText"_key), attribute);
    return labelForElements(parts);
  }

  Ref<String> _accessibilityLabelAttribute() {
    return cast<String>(getAssociatedObject(self, &labelAttributeKey));
  }
  void _accessibilitySetLabelAttribute(Ref<String> attribute) {
    setAssociatedObject(self, &labelAttributeKey, attribute);
  }

 private:
  static void addFigure(MutableArray& parts, std::string_view header, const Ref<Object>& text,
                        const Ref<String>& attribute) {
    const Ref<String> figure = castAsClass<String>(text);
    if (isEmpty(figure)) return;
    parts.axSafelyAddObject(accessibilityLocalizedString(header));
    parts.axSafelyAddObject(attribute ? marked(figure, attribute) : figure);
  }

  static Ref<String> marked(const Ref<String>& figure, const Ref<String>& attribute) {
    const auto spoken = AccessibilityAttributedString::initWithString(figure);
    spoken->setAttributeForKey(number(true), Selector::intern(attribute->text()));
    return spoken;
  }
};

}  // namespace

AX_CATEGORY(CHWorkoutSummaryTabbedLabelContainerAccessibility, "_CHWorkoutSummaryTabbedLabelContainer",
            overrides<&C::_accessibilityLabelAttribute>(messages::_accessibilityLabelAttribute),
            overrides<&C::_accessibilitySetLabelAttribute>(messages::_accessibilitySetLabelAttribute))

}  // namespace ax
