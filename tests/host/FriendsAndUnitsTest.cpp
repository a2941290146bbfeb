#include <gtest/gtest.h>

#include "host/daydetail/VLUIUnitManager.h"
#include "host/sharing/CHFriendInboxBarButtonView.h"
#include "host/sharing/CHFriendListTableViewCell.h"
#include "platform/foundation/Environment.h"

// The app's own behaviour, on which its accessibility stands.
namespace ax::host {

namespace {

Ref<Friend> friendWith(const char* key, bool value) {
  const auto made = make<Friend>();
  EXPECT_TRUE(made->isa().instanceVariable("name"_key)->write(*made, string("Mia")));
  EXPECT_TRUE(made->isa().instanceVariable(Selector::intern(key))->write(*made, box(value)));
  return made;
}

}  // namespace

TEST(HostFriendRowTest, IsUsedAgainWithoutTracesOfTheFormerFriend) {
  const auto row = make<CHFriendListTableViewCell>();
  row->setFriendSnapshotFormattingManagerAnimated(friendWith("isCompeting", true), make<FriendSnapshot>(),
                                                  nullptr, false);
  const Ref<View> badge = row->competitionBadgeView();
  ASSERT_NE(badge, nullptr);
  EXPECT_TRUE(badge->isDescendantOf(*row));
  const Ref<Label> name = row->textLabel();
  row->setFriendSnapshotFormattingManagerAnimated(friendWith("hasNews", true), nullptr, nullptr, true);
  EXPECT_EQ(row->competitionBadgeView(), nullptr);
  EXPECT_EQ(badge->superview(), nullptr);
  EXPECT_EQ(row->textLabel(), name);
  EXPECT_EQ(name->text()->text(), "\u2022 Mia");
  EXPECT_EQ(row->detailLineOneLabel()->text(), nullptr);
  EXPECT_EQ(row->contentView()->subviews().size(), 3u);
}

TEST(HostInboxBadgeTest, IsHiddenWhileNothingWaits) {
  const auto badge = make<CHFriendInboxBadgeView>();
  for (const auto& [text, hidden] : {std::pair{"", true}, {"3", false}, {"0", true}, {"10", false}}) {
    badge->setBadgeText(string(text));
    EXPECT_EQ(badge->isHidden(), hidden) << text;
  }
}

TEST(UnitManagerTest, AnswersAUnitOfEnergyInAnyCase) {
  const Environment before = environment();
  for (const auto& [chosen, unit] :
       {std::pair{"kcal", "kcal"}, {"kJ", "kJ"}, {"km", "kcal"}, {"", "kcal"}, {"calories", "kcal"}}) {
    setEnvironment({.energyUnit = chosen});
    EXPECT_EQ(VLUIUnitManager::sharedManager()->userActiveEnergyBurnedUnit()->text(), unit) << chosen;
  }
  setEnvironment(before);
}

}  // namespace ax::host
