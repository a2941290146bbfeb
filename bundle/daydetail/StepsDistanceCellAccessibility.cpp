#include "bundle/core/Category.h"
#include "bundle/shared/AXGroupedTitleValueView.h"

namespace ax {

namespace {

const Message<void()> setupSubviews{"_setupSubviews"};
const Message<void()> axUpdateAccessibilityElements{"_axUpdateAccessibilityElements"};

// A day's steps, distance and flights: one element for each caption with its figure.
class StepsDistanceCellAccessibility : public SafeCategory<StepsDistanceCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "StepsDistanceCell";
    manager.validateClassHasInstanceVariableWithType(target, "_stepsTitle", "Label");
    manager.validateClassHasInstanceVariableWithType(target, "_stepsValue", "Label");
    manager.validateClassHasInstanceVariableWithType(target, "_distanceTitle", "Label");
    manager.validateClassHasInstanceVariableWithType(target, "_distanceValue", "Label");
    manager.validateClassHasInstanceVariableWithType(target, "_flightsTitle", "Label");
    manager.validateClassHasInstanceVariableWithType(target, "_flightsValue", "Label");
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

using C = StepsDistanceCellAccessibility;

const CategoryRegistration<C> registration{
    "StepsDistanceCellAccessibility",
    "StepsDistanceCell",
    {overrides<&C::_accessibilityLoadAccessibilityInformation>(
         messages::_accessibilityLoadAccessibilityInformation),
     overrides<&C::_setupSubviews>(setupSubviews),
     overrides<&C::_axUpdateAccessibilityElements>(axUpdateAccessibilityElements)}};

}  // namespace

}  // namespace ax
