#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"

namespace ax {

namespace {

// One badge of the grid, named by the title of its achievement.
class CHAchievementCollectionViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceMethod("achievement", {"@"});
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return accessibilityLocalizedStringForAchievement(self.safeValueForKey("achievement"_key));
  }
};

}  // namespace

AX_CATEGORY(CHAchievementCollectionViewCellAccessibility, "CHAchievementCollectionViewCell")

}  // namespace ax
