#include "bundle/core/Category.h"
#include "platform/foundation/Formatters.h"
#include "platform/toolkit/Label.h"

namespace ax {

namespace {

// The title over a month, shown as a number and spoken by name.
class VeltoMonthTitleLabelAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) { contract.isKindOf("Label"); }

  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitHeader; }

  Ref<String> accessibilityLabel() {
    const Ref<String> month = messages::text(castAsClass<Label>(self));
    if (isEmpty(month)) return super(messages::accessibilityLabel);
    return dateStringForFormat(dateFromStringWithFormat(month, "MM"), "MMMM");
  }
};

}  // namespace

AX_CATEGORY(VeltoMonthTitleLabelAccessibility, "_VeltoMonthTitleLabel")

}  // namespace ax
