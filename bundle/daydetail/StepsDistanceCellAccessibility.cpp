#include "bundle/core/Category.h"
#include "bundle/shared/AXGroupedTitleValueView.h"

namespace ax {

namespace {

constinit const Message<void()> setupSubviews{"_setupSubviews"};
constinit const Message<void()> axUpdateAccessibilityElements{"_axUpdateAccessibilityElements"};

// A day's steps, distance and flights: one element for each caption with its figure.
class StepsDistanceCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_stepsTitle", "Label");
    contract.instanceVariable("_stepsValue", "Label");
    contract.instanceVariable("_distanceTitle", "Label");
    contract.instanceVariable("_distanceValue", "Label");
    contract.instanceVariable("_flightsTitle", "Label");
    contract.instanceVariable("_flightsValue", "Label");
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    axUpdateAccessibilityElements(self);
  }

  void _setupSubviews() {
    super(setupSubviews);
    axUpdateAccessibilityElements(self);
  }

  void _axUpdateAccessibilityElements() {
    const Ref<MutableArray> elements = make<MutableArray>();
    elements->axSafelyAddObject(pair("_stepsTitle"_key, "_stepsValue"_key));
    elements->axSafelyAddObject(pair("_distanceTitle"_key, "_distanceValue"_key));
    elements->axSafelyAddObject(pair("_flightsTitle"_key, "_flightsValue"_key));
    messages::setAccessibilityElements(self, elements);
  }

 private:
  Ref<Object> pair(Key title, Key value) {
    return AXGroupedTitleValueView::initWithAccessibilityContainerTitleViewValueView(
        self, self.safeValueForKey(title), self.safeValueForKey(value));
  }
};

}  // namespace

AX_CATEGORY(StepsDistanceCellAccessibility, "StepsDistanceCell", overrides<&C::_setupSubviews>(setupSubviews),
            overrides<&C::_axUpdateAccessibilityElements>(axUpdateAccessibilityElements))

}  // namespace ax
