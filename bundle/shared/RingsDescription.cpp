#include "bundle/shared/RingsDescription.h"

#include "bundle/shared/LocalizedString.h"
#include "bundle/shared/WheelchairUse.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/KeyReading.h"
#include "platform/toolkit/SpokenText.h"

namespace ax {

namespace messages {
constinit const Message<Ref<String>()> _accessibilityRingsDescription{"_accessibilityRingsDescription"};
constinit const Message<void(Ref<String>)> _accessibilitySetRingsDescription{
    "_accessibilitySetRingsDescription:"};
constinit const Message<Ref<String>(double, double, double, bool)>
    _veltoUIAccessibilityDescriptionForPercentages{
        "_veltoUIAccessibilityDescriptionForPercentages:exercisingPercentage:standingPercentage:"
        "arePercentagesCapped:"};
}  // namespace messages

namespace {

constinit const Message<Ref<String>(double, double, double, bool)> hostDescription{
    "accessibilityDescriptionForPercentages:exercisingPercentage:standingPercentage:arePercentagesCapped:"};

const char ringsDescriptionKey = 0;

Ref<String> valueText(double fraction, bool capped) {
  const double clamped = fraction > 0 ? fraction : 0;
  if (capped && clamped == 1) return accessibilityLocalizedString("lifestyle.goal.completed");
  return formatFloatWithPercentage(static_cast<float>(clamped));
}

Ref<String> standLabel() {
  return accessibilityLocalizedString(_userIsWheelchairUserWithParloOn()
                                          ? "lifestyle.active.hours.wheelchair.roll"
                                          : "lifestyle.active.hours");
}

// The part of the bundle that every object gets.
struct AXVeltoPriv {
  static Ref<Object> ringsDescription(Object& self) {
    return getAssociatedObject(self, &ringsDescriptionKey);
  }

  static void setRingsDescription(Object& self, Ref<String> description) {
    setAssociatedCopiedObject(self, &ringsDescriptionKey, description);
  }

  static Ref<String> descriptionForPercentages(Object& self, double move, double exercise, double stand,
                                               bool capped) {
    Ref<String> description;
    performSafeBlock([&] { description = hostDescription(self, move, exercise, stand, capped); });
    return description;
  }

  AXVeltoPriv() {
    ClassBuilder<Object>(Object::staticClass())
        .method<&ringsDescription>(messages::_accessibilityRingsDescription.selector().name())
        .method<&setRingsDescription>(messages::_accessibilitySetRingsDescription.selector().name())
        .method<&descriptionForPercentages>(
            messages::_veltoUIAccessibilityDescriptionForPercentages.selector().name());
  }
};

const AXVeltoPriv priv;

}  // namespace

}  // namespace ax

using namespace ax;

Ref<String> accessibilityDescriptionForPercentages(double move, double exercise, double stand,
                                                   bool arePercentagesCapped) {
  if (arePercentagesCapped && move == 1 && exercise == 1 && stand == 1) {
    return ax::accessibilityLocalizedString("lifestyle.all.goals.completed");
  }
  return stringForVariables({ax::accessibilityLocalizedString("lifestyle.calories.burned"),
                             valueText(move, arePercentagesCapped),
                             ax::accessibilityLocalizedString("lifestyle.active.minutes"),
                             valueText(exercise, arePercentagesCapped), standLabel(),
                             valueText(stand, arePercentagesCapped), stringForVariablesSentinel});
}
