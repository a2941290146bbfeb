#include <gtest/gtest.h>

#include "host/sharing/CHFriendDetailCollectionViewController.h"
#include "host/sharing/CHFriendInboxTableViewController.h"
#include "host/sharing/CHFriendListViewController.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

// What scenes cannot show of the buttons in the friends' navigation bars: whose objects they keep, and bars
// that hold other things than buttons.
namespace ax {

namespace {

Ref<BarButtonItem> messageItem(const char* title) {
  const Ref<BarButtonItem> item = make<BarButtonItem>();
  item->setTitle(string(title));
  item->setAction(selectorFromString("_sendMessageButtonTapped:"));
  return item;
}

class NavigationButtonsTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  const EnvironmentScope environment_{Environment{.timeZone = "America/Lima", .now = 1780000000}};
};

TEST_F(NavigationButtonsTest, TheSortButtonEndsWithItsScreen) {
  auto list = make<host::CHFriendListViewController>();
  messages::viewDidLoad(list);
  Ref<BarButtonItem> item = list->navigationItem()->rightBarButtonItem();
  ASSERT_NE(item, nullptr);
  EXPECT_EQ(labelOf(item), "Sort by");
  EXPECT_EQ(valueOf(item), "Name");
  const auto value = AccessibilityProperties::find(*item)->blocks->value;
  const Weak<BarButtonItem> weak = item;
  item = nullptr;
  list = nullptr;
  EXPECT_EQ(weak.lock(), nullptr);
  EXPECT_EQ(value(), nullptr);
}

TEST_F(NavigationButtonsTest, TheNextMessageButtonIsNamedOnceTheFirstIsGone) {
  const auto inbox = make<host::CHFriendInboxTableViewController>();
  const Ref<BarButtonItem> first = messageItem("One");
  const Ref<BarButtonItem> second = messageItem("Two");
  inbox->navigationItem()->setRightBarButtonItems(array({first, second}));
  load(inbox);
  load(inbox);
  EXPECT_EQ(labelOf(first), "Messages");
  EXPECT_EQ(labelOf(second), "Two");
  inbox->navigationItem()->setRightBarButtonItems(array({second}));
  load(inbox);
  EXPECT_EQ(labelOf(second), "Messages");
}

TEST_F(NavigationButtonsTest, WhatIsNoButtonInTheBarIsPassedOver) {
  const auto detail = make<host::CHFriendDetailCollectionViewController>();
  const auto view = make<View>();
  const Ref<BarButtonItem> item = messageItem("Write");
  detail->navigationItem()->setRightBarButtonItems(array({view, string("Write"), item}));
  load(detail);
  EXPECT_EQ(labelOf(view), "(none)");
  EXPECT_EQ(labelOf(item), "Messages");
  EXPECT_EQ(hintOf(item), "Opens a new message");
}

TEST_F(NavigationButtonsTest, BothMessageButtonsSpeakAlikeInEveryLanguage) {
  for (const char* locale : localesOfAllLanguages) {
    const EnvironmentScope language{Environment{.locale = locale}};
    const auto inbox = make<host::CHFriendInboxTableViewController>();
    const auto detail = make<host::CHFriendDetailCollectionViewController>();
    messages::viewDidLoad(inbox);
    messages::viewDidLoad(detail);
    const Ref<BarButtonItem> one = inbox->navigationItem()->rightBarButtonItem();
    const Ref<BarButtonItem> other = detail->navigationItem()->rightBarButtonItem();
    EXPECT_EQ(labelOf(one), labelOf(other)) << locale;
    EXPECT_EQ(hintOf(one), hintOf(other)) << locale;
    EXPECT_FALSE(hintOf(one).empty()) << locale;
    EXPECT_NE(labelOf(one), hintOf(one)) << locale;
  }
}

}  // namespace

}  // namespace ax
