#include "bundle/achievements/TextLines.h"
#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"
#include "platform/foundation/Formatters.h"

namespace ax {

namespace {

constinit const Message<void()> axAnnotateAchievementView{"_axAnnotateAchievementView"};
constinit const Message<Ref<Object>(Ref<Object>)> titleForAchievement{"titleForAchievement:"};

// The screen of one achievement: the container of the badge speaks for it, and the text speaks all its lines.
class CHAchievementDetailViewControllerAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_achievement", "ACHAchievement");
    contract.instanceMethod("label", {"@"});
    contract.instanceMethod("badgeContainer", {"@"});
    contract.instanceMethod("viewDidLoad", {"v"});
    contract.instanceVariable("_locProvider", "ODUIAchievementLocalizationProvider");
    contract.of("ODUIAchievementLocalizationProvider").instanceMethod("titleForAchievement:", {"@", "@"});
  }

  void viewDidLoad() {
    super(messages::viewDidLoad);
    axAnnotateAchievementView(self);
  }

  void _accessibilityLoadAccessibilityInformation() {
    super(messages::_accessibilityLoadAccessibilityInformation);
    axAnnotateAchievementView(self);
  }

  void _axAnnotateAchievementView() {
    const Ref<String> title = achievementTitle();
    if (!isEmpty(title)) annotateBadgeContainer(title);
    const Ref<Label> label = castAsClass<Label>(self.safeValueForKey("label"_key));
    const Ref<String> text = messages::text(label);
    if (!isEmpty(text)) messages::setAccessibilityLabel(label, labelForLines(*text));
  }

 private:
  Ref<String> achievementTitle() {
    const Ref<Object> achievement = self.safeValueForKey("_achievement"_key);
    Ref<Object> title;
    performSafeBlock(
        [&] { title = titleForAchievement(self.safeValueForKey("_locProvider"_key), achievement); });
    return castAsClass<String>(title);
  }

  // The container may be transparent while the badge flips in.
  void annotateBadgeContainer(const Ref<String>& title) {
    const Ref<View> container = safeUIViewForKey(self, "badgeContainer"_key);
    messages::setIsAccessibilityElement(container, true);
    messages::setAccessibilityLabel(
        container, stringWithFormat(accessibilityLocalizedString("achievement.badge.format"), {title}));
    _accessibilitySetViewIsVisible(container, true);
    _accessibilitySetOverridesInvisibility(container, true);
  }
};

}  // namespace

AX_CATEGORY(CHAchievementDetailViewControllerAccessibility, "CHAchievementDetailViewController",
            overrides<&C::_axAnnotateAchievementView>(axAnnotateAchievementView))

}  // namespace ax
