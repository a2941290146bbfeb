#include <gtest/gtest.h>

#include "host/achievements/CHAchievementCells.h"
#include "host/achievements/CHAchievementDetailViewController.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "platform/toolkit/ElementTree.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

namespace ax {

namespace {

class DetailScreenTest : public testing::Test {
 protected:
  void SetUp() override {
    ASSERT_NO_FATAL_FAILURE(startBundle());
    screen_->setBadgeContainer(container_);
    screen_->setLabel(label_);
    EXPECT_TRUE(screen_->isa().instanceVariable("_locProvider"_key)->write(*screen_, provider_));
  }

  void giveTitle(const ScriptedAnswer& answer) {
    EXPECT_TRUE(setScriptedAnswer(*provider_, selectorFromString("titleForAchievement:"), answer));
  }

  const EnvironmentScope environment_{Environment{.timeZone = "Asia/Tokyo", .now = 1780000000}};
  const Ref<host::CHAchievementDetailViewController> screen_ =
      make<host::CHAchievementDetailViewController>();
  const Ref<host::ODUIAchievementLocalizationProvider> provider_ =
      make<host::ODUIAchievementLocalizationProvider>();
  const Ref<View> container_ = make<View>();
  const Ref<Label> label_ = make<Label>();
};

TEST_F(DetailScreenTest, SpeaksTitlesThatLookLikePatterns) {
  for (const char* title : {"{0}", "It's {1} o'clock", "100%", "''", "{0, plural, other {#}}"}) {
    giveTitle([&](auto) { return Ref<Object>(string(title)); });
    load(screen_);
    EXPECT_EQ(labelOf(container_), std::string(title) + " badge");
  }
}

TEST_F(DetailScreenTest, MakesTheContainerVisibleHoweverTheHostHidesIt) {
  giveTitle([](auto) { return Ref<Object>(string("First run")); });
  messages::viewDidLoad(screen_);
  EXPECT_TRUE(_accessibilityViewIsVisible(container_));
  container_->setAlpha(0);
  EXPECT_TRUE(_accessibilityViewIsVisible(container_));
  container_->setHidden(true);
  screen_->view()->setAlpha(0);
  EXPECT_TRUE(_accessibilityViewIsVisible(container_));
  EXPECT_FALSE(_accessibilityViewIsVisible(label_));
}

TEST_F(DetailScreenTest, KeepsTheLastTitleWhenTheProviderFailsLater) {
  giveTitle([](auto) { return Ref<Object>(string("First run")); });
  load(screen_);
  giveTitle([](auto) -> Ref<Object> { throw 3; });  // not even an exception object
  label_->setText(string("Earned"));
  load(screen_);
  EXPECT_EQ(labelOf(container_), "First run badge");
  EXPECT_EQ(labelOf(label_), "Earned");
}

TEST_F(DetailScreenTest, AsksTheProviderForTheAchievementThatIsShown) {
  const auto achievement = make<host::ACHAchievement>();
  EXPECT_TRUE(screen_->isa().instanceVariable("_achievement"_key)->write(*screen_, achievement));
  Ref<Object> asked;
  giveTitle([&](auto arguments) {
    asked = arguments[0];
    return Ref<Object>();
  });
  load(screen_);
  EXPECT_EQ(asked, achievement);
  EXPECT_FALSE(messages::isAccessibilityElement(container_));
}

// The screen and the badges of the grid must split a text alike.
TEST_F(DetailScreenTest, SplitsTextsAsTheGridDoes) {
  const auto content = make<host::CHAchievementsCellContentView>();
  EXPECT_TRUE(content->isa().instanceVariable("_label"_key)->write(*content, label_));
  const std::pair<const char*, const char*> texts[] = {
      {"One", "One"},
      {"One\nTwo", "One, Two"},
      {"\n\nOne\r\nTwo\r", "One, Two"},
      {"One\u0085Two\u2028Three\u2029Four", "One, Two, Three, Four"},
      {"One, Two\nThree", "One, Two, Three"},
      {"\u00c5\n\u2013", "\u00c5, \u2013"}};
  for (const auto& [text, spoken] : texts) {
    label_->setText(string(text));
    load(screen_);
    EXPECT_EQ(labelOf(content), spoken);
    EXPECT_EQ(labelOf(label_), spoken);
  }
}

}  // namespace

}  // namespace ax
