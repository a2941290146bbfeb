#include "bundle/achievements/TextLines.h"
#include "bundle/core/Category.h"

namespace ax {

namespace {

// A badge with its text: one button, with all lines of the text as its label.
class CHAchievementsCellContentViewAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("label", {"@"});
    contract.instanceMethod("badgeView", {"@"});
  }

  bool isAccessibilityElement() { return true; }

  Ref<String> accessibilityLabel() {
    const Ref<Label> label = castAsClass<Label>(self.safeValueForKey("_label"_key));
    const Ref<String> text = messages::text(label);
    return isEmpty(text) ? super(messages::accessibilityLabel) : labelForLines(*text);
  }

  Ref<String> accessibilityValue() {
    const Ref<Object> badge = self.safeValueForKey("_badgeView"_key);
    const Ref<String> value =
        answerOfPart(messages::accessibilityValue, self, safeValueForKey(badge, "image"_key));
    return isEmpty(value) ? super(messages::accessibilityValue) : value;
  }

  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitButton; }
};

}  // namespace

AX_CATEGORY(CHAchievementsCellContentViewAccessibility, "CHAchievementsCellContentView")

}  // namespace ax
