#include "bundle/core/Category.h"
#include "platform/foundation/AttributedString.h"
#include "platform/runtime/Number.h"

namespace ax {

namespace {

constinit const Message<Ref<Object>(Ref<Object>, Ref<Object>)> formattedDurationForWorkoutContext{
    "formattedDurationForWorkout:context:"};

// Gives every duration that the host writes a spoken form that is read as one.
class CHWorkoutFormattingManagerAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("formattedDurationForWorkout:context:", {"@", "@", "@"});
  }

  Ref<Object> formattedDurationForWorkoutContext(Ref<Object> workout, Ref<Object> context) {
    const Ref<Object> result = super(ax::formattedDurationForWorkoutContext, workout, context);
    const Ref<AttributedString> formatted = castAsClass<AttributedString>(result);
    const Ref<String> duration = messages::string(formatted);
    if (isEmpty(duration)) return result;
    const auto spoken = AccessibilityAttributedString::initWithString(duration);
    spoken->setAttributeForKey(number(true), DurationTimeHHMMSS);
    messages::setAccessibilityLabel(formatted, spoken);
    return result;
  }
};

}  // namespace

AX_CATEGORY(CHWorkoutFormattingManagerAccessibility, "CHWorkoutFormattingManager",
            overrides<&C::formattedDurationForWorkoutContext>(ax::formattedDurationForWorkoutContext))

}  // namespace ax
