#include "bundle/core/Category.h"

namespace ax {

namespace {

// The row of one competition: the score, then the days that remain.
class CHFriendListCompetitionTableViewCellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.instanceVariable("_daysRemainingLabel", "Label");
    contract.instanceVariable("_scoreView", "ASCompetitionScoreView");
  }

  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() {
    return _accessibilityStringForLabelKeyValues(self, "_scoreView, _daysRemainingLabel");
  }
};

}  // namespace

AX_CATEGORY(CHFriendListCompetitionTableViewCellAccessibility, "CHFriendListCompetitionTableViewCell")

}  // namespace ax
