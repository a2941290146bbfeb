#include <gtest/gtest.h>

#include "host/sharing/CHFriendListTableViewCell.h"
#include "platform/runtime/Number.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

// What a scene cannot show of a friend's row: what its blocks hold, and what becomes of marked texts.
namespace ax {

namespace {

const Message<void(Ref<Object>, Ref<Object>, Ref<Object>, bool)> setFriend{
    "setFriend:snapshot:formattingManager:animated:"};

class FriendRowTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  Ref<Label> labelled(const char* text) {
    const Ref<Label> label = make<Label>();
    label->setText(string(text));
    return label;
  }

  const EnvironmentScope environment_{Environment{.timeZone = "Pacific/Auckland", .now = 1780000000}};
  Ref<host::CHFriendListTableViewCell> row_ = make<host::CHFriendListTableViewCell>();
};

TEST_F(FriendRowTest, NeitherKeepsItsNameAliveNorNeedsIt) {
  row_->setTextLabel(labelled("\u2022 Mia"));
  load(row_);
  const Weak<Label> name = row_->textLabel();
  const auto block = AccessibilityProperties::find(*row_->textLabel())->blocks->label;
  EXPECT_EQ(plain(block()), " Mia");
  row_ = nullptr;
  EXPECT_EQ(name.lock(), nullptr);
  EXPECT_EQ(block(), nullptr);
}

TEST_F(FriendRowTest, RemovesBulletsAloneFromAmongTheirLikes) {
  const std::pair<const char*, const char*> names[] = {{"\u2022", ""},
                                                       {"\u2022\u2022\u2022Mia", "Mia"},
                                                       {"\u2023Mia\u00b7\u2027", "\u2023Mia\u00b7\u2027"},
                                                       {"\u00e2\u20ac\u2022\u00a2", "\u00e2\u20ac\u00a2"},
                                                       {"\u7f8e\u2022\u96ea", "\u7f8e\u96ea"}};
  for (const auto& [shown, spoken] : names) {
    row_->setTextLabel(labelled(shown));
    load(row_);
    EXPECT_EQ(labelOf(row_->textLabel()), spoken) << shown;
  }
}

TEST_F(FriendRowTest, KeepsTheMarksOfItsLines) {
  row_->setTextLabel(labelled("Mia"));
  row_->setDetailLineTwoLabel(labelled("5'30\""));
  auto pace = make<AccessibilityAttributedString>(std::string("330"));
  pace->setAttributeForKey(number(true), DurationTimeMMSS);
  messages::setAccessibilityLabel(row_->detailLineTwoLabel(), pace);
  load(row_);
  const auto label = cast<AccessibilityAttributedString>(Ref<Object>(messages::accessibilityLabel(row_)));
  ASSERT_NE(label, nullptr);
  EXPECT_EQ(label->text(), "Mia, 330");
  ASSERT_EQ(label->attributes().size(), 1u);
  EXPECT_EQ(label->attributes()[0].range, (TextRange{5, 3}));
}

TEST_F(FriendRowTest, ShowsNobodyWhenGivenSomethingElse) {
  row_->setTextLabel(labelled("Mia"));
  load(row_);
  row_->textLabel()->setText(string("Noor"));
  const auto notAFriend = make<Object>();
  setFriend(row_, notAFriend, notAFriend, nullptr, true);
  EXPECT_EQ(labelOf(row_), "");  // the host shows nobody
  EXPECT_EQ(row_->competitionBadgeView(), nullptr);
}

}  // namespace

}  // namespace ax
