#include "bundle/core/Category.h"
#include "platform/foundation/Formatters.h"
#include "platform/toolkit/Label.h"

namespace ax {

namespace {

// The title over a month, shown as a number and spoken by name.
class VeltoMonthTitleLabelAccessibility : public SafeCategory<VeltoMonthTitleLabelAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    manager.validateClassIsKindOfClass("_VeltoMonthTitleLabel", "Label");
  }

  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitHeader; }

  Ref<String> accessibilityLabel() {
    const Ref<String> month = messages::text(castAsClass<Label>(self));
    if (isEmpty(month)) return super(messages::accessibilityLabel);
    return dateStringForFormat(dateFromStringWithFormat(month, "MM"), "MMMM");
  }
};

using C = VeltoMonthTitleLabelAccessibility;

const CategoryRegistration<C> registration{"_VeltoMonthTitleLabelAccessibility",
                                           "_VeltoMonthTitleLabel",
                                           {overrides<&C::accessibilityTraits>(messages::accessibilityTraits),
                                            overrides<&C::accessibilityLabel>(messages::accessibilityLabel)}};

}  // namespace

}  // namespace ax
