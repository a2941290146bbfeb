#include "bundle/core/Category.h"
#include "platform/foundation/AttributedString.h"

namespace ax {

namespace {

const Message<Ref<Object>(Ref<Object>, Ref<String>)> attrStringWithValueUnit{"attrStringWithValue:unit:"};

// Gives the host's value-and-unit strings a spoken unit where the unit has one.
class AX_VeltoNSStringAccessibility : public SafeCategory<AX_VeltoNSStringAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    manager.validateClassHasClassMethodWithFullSignature("String",
                                                         "attrStringWithValue: unit:", {"@", "@", "@"});
  }

  Ref<Object> attrStringWithValueUnit(Ref<Object> value, Ref<String> unit) {
    Ref<Object> result = super(ax::attrStringWithValueUnit, value, unit);
    if (const Ref<String> spokenUnit = messages::accessibilityLabel(unit)) {
      messages::setAccessibilityLabel(result, textOf(super(ax::attrStringWithValueUnit, value, spokenUnit)));
    }
    return result;
  }

 private:
  static Ref<String> textOf(const Ref<Object>& styled) {
    if (const Ref<AttributedString> attributed = cast<AttributedString>(styled))
      return messages::string(attributed);
    return cast<String>(styled);
  }
};

using C = AX_VeltoNSStringAccessibility;

const CategoryRegistration<C> registration{
    "AX_VeltoNSStringAccessibility",
    "String",
    {overridesClassMethod<&C::attrStringWithValueUnit>(ax::attrStringWithValueUnit)}};

}  // namespace

}  // namespace ax
