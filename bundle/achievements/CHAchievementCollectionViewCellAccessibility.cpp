#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"

namespace ax {

namespace {

// One badge of the grid, named by the title of its achievement.
class CHAchievementCollectionViewCellAccessibility
    : public SafeCategory<CHAchievementCollectionViewCellAccessibility> {
 public:
  using SafeCategory::SafeCategory;

  static void _accessibilityPerformValidations(Manager& manager) {
    manager.validateClassHasInstanceMethodWithFullSignature("CHAchievementCollectionViewCell", "achievement",
                                                            {"@"});
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return accessibilityLocalizedStringForAchievement(self.safeValueForKey("achievement"_key));
  }
};

using C = CHAchievementCollectionViewCellAccessibility;

const CategoryRegistration<C> registration{
    "CHAchievementCollectionViewCellAccessibility",
    "CHAchievementCollectionViewCell",
    {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
     overrides<&C::accessibilityLabel>(messages::accessibilityLabel)}};

}  // namespace

}  // namespace ax
