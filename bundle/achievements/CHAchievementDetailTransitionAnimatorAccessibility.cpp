#include "bundle/core/Category.h"
#include "platform/runtime/Boxing.h"

namespace ax {

namespace {

using Block = std::function<void()>;

constexpr std::string_view initializer =
    "initWithPresentingViewController:detailViewController:shouldPlayFlipInAnimation:initialBadgeFrame:"
    "conversionView:presentAlongsideBlock:dismissAlongsideBlock:completionBlock:";

constinit const Message<Ref<Object>(Ref<Object>, Ref<Object>, bool, Rect, Ref<Object>, Block, Block, Block)>
    initWithDetail{initializer};

// The flip to the screen of an achievement: from then on the badge is spoken through its container alone.
class CHAchievementDetailTransitionAnimatorAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod(initializer, {"@", "@", "@", "B", rectEncoding, "@", "@?", "@?", "@?"});
    contract.instanceVariable("_detailViewController", "CHAchievementDetailViewController");
    contract.of("CHAchievementDetailViewController").instanceVariable("_badgeView", "ODUIBadgeView");
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

}  // namespace

AX_CATEGORY(CHAchievementDetailTransitionAnimatorAccessibility, "CHAchievementDetailTransitionAnimator",
            overrides<&C::init>(initWithDetail))

}  // namespace ax
