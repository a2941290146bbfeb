#include "bundle/core/Category.h"
#include "bundle/shared/AXGroupedTitleValueView.h"
#include "bundle/shared/LocalizedString.h"
#include "bundle/shared/Pace.h"

namespace ax {

namespace {

constinit const Message<void(Ref<Object>, Ref<Object>)> configureWithTitle1Value1{
    "configureWithTitle1:value1:"};
constinit const Message<void(Ref<Object>, Ref<Object>)> configureWithTitle2Value2{
    "configureWithTitle2:value2:"};
constinit const Message<Ref<String>(Ref<Object>)> axStringForValue{"_axStringForValue:"};
constinit const Message<Ref<Array>()> axElements{"_axElements"};
constinit const Message<void(Ref<Array>)> axSetElements{"_axSetElements:"};

const char elementsKey = 0;

// Two figures side by side: two elements, each with its title as label and its figure as value.
class CHWorkoutDetailTwoValueTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_titleLabel1", "Label");
    contract.instanceVariable("_titleLabel2", "Label");
    contract.instanceVariable("_valueLabel1", "Label");
    contract.instanceVariable("_valueLabel2", "Label");
    contract.instanceMethod("configureWithTitle1: value1:", {"v", "@", "@"});
    contract.instanceMethod("configureWithTitle2: value2:", {"v", "@", "@"});
  }

  bool isAccessibilityElement() { return false; }

  Ref<Array> accessibilityElements() {
    if (const Ref<Array> stored = axElements(self)) return stored;
    const Ref<Object> title1 = self.safeValueForKey("_titleLabel1"_key);
    const Ref<Object> title2 = self.safeValueForKey("_titleLabel2"_key);
    const Ref<Object> value1 = self.safeValueForKey("_valueLabel1"_key);
    const Ref<Object> value2 = self.safeValueForKey("_valueLabel2"_key);
    if (title1 && title2 && value1 && value2) {
      axSetElements(self, array({grouped(title1, value1), grouped(title2, value2)}));
    }
    return axElements(self);
  }

  void configureWithTitle1Value1(Ref<Object> title, Ref<Object> value) {
    super(ax::configureWithTitle1Value1, title, value);
    messages::setAccessibilityLabel(self.safeValueForKey("_valueLabel1"_key), axStringForValue(self, value));
  }
  void configureWithTitle2Value2(Ref<Object> title, Ref<Object> value) {
    super(ax::configureWithTitle2Value2, title, value);
    messages::setAccessibilityLabel(self.safeValueForKey("_valueLabel2"_key), axStringForValue(self, value));
  }

  Ref<String> _axStringForValue(Ref<Object> value) {
    const Ref<String> shown = safeStringForKey(value, "string"_key);
    return shown && marksMissingData(*shown) ? accessibilityLocalizedString("no.data")
                                             : messages::accessibilityUserDefinedLabel(value);
  }

  Ref<Array> _axElements() { return cast<Array>(getAssociatedObject(self, &elementsKey)); }
  void _axSetElements(Ref<Array> elements) { setAssociatedObject(self, &elementsKey, elements); }

 private:
  Ref<Object> grouped(const Ref<Object>& title, const Ref<Object>& value) {
    return AXGroupedTitleValueView::initWithAccessibilityContainerTitleViewValueView(self, title, value);
  }
};

}  // namespace

AX_CATEGORY(CHWorkoutDetailTwoValueTableViewCellAccessibility, "CHWorkoutDetailTwoValueTableViewCell",
            overrides<&C::configureWithTitle1Value1>(ax::configureWithTitle1Value1),
            overrides<&C::configureWithTitle2Value2>(ax::configureWithTitle2Value2),
            overrides<&C::_axStringForValue>(axStringForValue), overrides<&C::_axElements>(axElements),
            overrides<&C::_axSetElements>(axSetElements))

}  // namespace ax
