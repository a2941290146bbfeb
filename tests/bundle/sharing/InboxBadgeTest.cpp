#include <gtest/gtest.h>

#include <chrono>

#include "host/sharing/CHFriendInboxBarButtonView.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

namespace ax {

namespace {

class InboxBadgeTest : public testing::Test {
 protected:
  void SetUp() override {
    ASSERT_NO_FATAL_FAILURE(startBundle());
    const InstanceVariable* variable = button_->isa().instanceVariable("_badgeView"_key);
    ASSERT_NE(variable, nullptr);
    ASSERT_TRUE(variable->write(*button_, badge_));
  }

  std::string valueFor(const std::string& text) {
    badge_->setBadgeText(string(text));
    return valueOf(button_);
  }

  const Ref<host::CHFriendInboxBarButtonView> button_ = make<host::CHFriendInboxBarButtonView>();
  const Ref<host::CHFriendInboxBadgeView> badge_ = make<host::CHFriendInboxBadgeView>();
};

// The app writes the number as the reader's region does, so that is how it must be read.
TEST_F(InboxBadgeTest, ReadsWhatEveryRegionWrites) {
  for (const char* locale : localesOfAllLanguages) {
    const EnvironmentScope language{Environment{.locale = locale}};
    for (const int count : {3, 11, 99, 45678}) {
      const std::string written = formatInteger(count)->text();
      EXPECT_NE(valueFor(written).find(written), std::string::npos) << locale << ' ' << written;
    }
    EXPECT_EQ(valueFor(formatInteger(0)->text()), "(none)") << locale;
    EXPECT_EQ(valueFor(formatInteger(-7)->text()), "(none)") << locale;
  }
}

TEST_F(InboxBadgeTest, CountsNoMoreThanThirtyTwoBitsHold) {
  const EnvironmentScope language{Environment{}};
  EXPECT_EQ(valueFor("2147483647"), "2,147,483,647 items waiting");
  EXPECT_EQ(valueFor("99999999999999999999"), "2,147,483,647 items waiting");
  EXPECT_EQ(valueFor("-99999999999999999999"), "(none)");
  EXPECT_EQ(valueFor("1e400"), "(none)");
}

// Reading digits takes a time that grows with the square of their number; a million once took seconds.
TEST_F(InboxBadgeTest, DoesNotReadDigitsWithoutEnd) {
  const auto start = std::chrono::steady_clock::now();
  EXPECT_EQ(valueFor(std::string(1 << 20, '9')), "(none)");
  EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(1));
}

TEST_F(InboxBadgeTest, HasNoValueWhenTheBadgeAnswersSomethingElse) {
  ASSERT_TRUE(setScriptedAnswer(*badge_, "badgeText"_key, [](auto) { return Ref<Object>(make<Array>()); }));
  EXPECT_EQ(valueOf(button_), "(none)");
  ASSERT_TRUE(setScriptedAnswer(*badge_, "badgeText"_key,
                                [](auto) -> Ref<Object> { throw std::runtime_error("no badge"); }));
  EXPECT_EQ(valueOf(button_), "(none)");
}

}  // namespace

}  // namespace ax
