#include "bundle/core/Category.h"
#include "platform/foundation/AttributedString.h"

namespace ax {

namespace {

constinit const Message<Ref<Object>(Ref<Object>, Ref<String>)> attrStringWithValueUnit{
    "attrStringWithValue:unit:"};

// Gives the host's value-and-unit strings a spoken unit where the unit has one.
class AX_VeltoNSStringAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.classMethod("attrStringWithValue: unit:", {"@", "@", "@"});
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

}  // namespace

AX_CATEGORY(AX_VeltoNSStringAccessibility, "String",
            overridesClassMethod<&C::attrStringWithValueUnit>(ax::attrStringWithValueUnit))

}  // namespace ax
