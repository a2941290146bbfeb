#include "bundle/achievements/TextLines.h"
#include "bundle/core/Category.h"

namespace ax {

namespace {

// A badge with its text: one button, with all lines of the text as its label.
class CHAchievementsCellContentViewAccessibility
    : public SafeCategory<CHAchievementsCellContentViewAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "CHAchievementsCellContentView";
    manager.validateClassHasInstanceMethodWithFullSignature(target, "label", {"@"});
    manager.validateClassHasInstanceMethodWithFullSignature(target, "badgeView", {"@"});
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

using C = CHAchievementsCellContentViewAccessibility;

const CategoryRegistration<C> registration{
    "CHAchievementsCellContentViewAccessibility",
    "CHAchievementsCellContentView",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel),
     overrides<&C::accessibilityValue>(messages::accessibilityValue),
     overrides<&C::accessibilityTraits>(messages::accessibilityTraits)}};

}  // namespace

}  // namespace ax
