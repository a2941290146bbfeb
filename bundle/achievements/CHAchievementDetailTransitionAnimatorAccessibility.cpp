#include "bundle/core/Category.h"
#include "platform/runtime/Boxing.h"

namespace ax {

namespace {

using Block = std::function<void()>;

constexpr std::string_view initializer =
    "initWithPresentingViewController:detailViewController:shouldPlayFlipInAnimation:initialBadgeFrame:"
    "conversionView:presentAlongsideBlock:dismissAlongsideBlock:completionBlock:";

const Message<Ref<Object>(Ref<Object>, Ref<Object>, bool, Rect, Ref<Object>, Block, Block, Block)>
    initWithDetail{initializer};

// The flip to the screen of an achievement: from then on the badge is spoken through its container alone.
class CHAchievementDetailTransitionAnimatorAccessibility
    : public SafeCategory<CHAchievementDetailTransitionAnimatorAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    constexpr auto target = "CHAchievementDetailTransitionAnimator";
    manager.validateClassHasInstanceMethodWithFullSignature(
        target, initializer, {"@", "@", "@", "B", rectEncoding, "@", "@?", "@?", "@?"});
    manager.validateClassHasInstanceVariableWithType(target, "_detailViewController",
                                                     "CHAchievementDetailViewController");
    manager.validateClassHasInstanceVariableWithType("CHAchievementDetailViewController", "_badgeView",
                                                     "ODUIBadgeView");
  }

  Ref<Object> init(Ref<Object> presenting, Ref<Object> detail, bool shouldPlayFlipInAnimation,
                   Rect initialBadgeFrame, Ref<Object> conversionView, Block presentAlongside,
                   Block dismissAlongside, Block completion) {
    const Ref<Object> animator =
        super(initWithDetail, presenting, detail, shouldPlayFlipInAnimation, initialBadgeFrame,
              conversionView, presentAlongside, dismissAlongside, completion);
    messages::_accessibilityLoadAccessibilityInformation(animator);
    return animator;
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    const Ref<Object> detail = self.safeValueForKey("_detailViewController"_key);
    messages::setIsAccessibilityElement(safeValueForKey(detail, "_badgeView"_key), false);
  }
};

using C = CHAchievementDetailTransitionAnimatorAccessibility;

const CategoryRegistration<C> registration{
    "CHAchievementDetailTransitionAnimatorAccessibility",
    "CHAchievementDetailTransitionAnimator",
    {overrides<&C::init>(initWithDetail), overrides<&C::_accessibilityLoadAccessibilityInformation>(
                                              messages::_accessibilityLoadAccessibilityInformation)}};

}  // namespace

}  // namespace ax
