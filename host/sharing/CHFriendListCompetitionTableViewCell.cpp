#include "host/sharing/CHFriendListCompetitionTableViewCell.h"

#include "host/core/HostStrings.h"
#include "host/core/Layout.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& ASCompetitionScoreView::staticClass() {
  using T = ASCompetitionScoreView;
  static Class& result = ClassBuilder<T>("ASCompetitionScoreView", View::staticClass())
                             .instanceVariable<&T::myScore_>("_myScore")
                             .instanceVariable<&T::friendScore_>("_friendScore")
                             .build();
  return result;
}

Ref<String> ASCompetitionScoreView::defaultLabel() {
  return hostText("friends.score", {formatInteger(myScore_), formatInteger(friendScore_)});
}

Class& CHFriendListCompetitionTableViewCell::staticClass() {
  using T = CHFriendListCompetitionTableViewCell;
  static Class& result = ClassBuilder<T>("CHFriendListCompetitionTableViewCell", TableViewCell::staticClass())
                             .instanceVariable<&T::daysRemainingLabel_>("_daysRemainingLabel")
                             .instanceVariable<&T::scoreView_>("_scoreView")
                             .build();
  return result;
}

void CHFriendListCompetitionTableViewCell::layoutSubviews() {
  addUnplaced(*contentView(), {daysRemainingLabel_, scoreView_});
}

static const RegisteredClass<ASCompetitionScoreView> registeredScoreView;
static const RegisteredClass<CHFriendListCompetitionTableViewCell> registered;

}  // namespace ax::host
