#include <gtest/gtest.h>

#include <atomic>
#include <chrono>
#include <cstdlib>
#include <future>
#include <stdexcept>
#include <thread>

#include "platform/accessibility/ValidationManager.h"
#include "platform/foundation/BackgroundQueue.h"
#include "platform/foundation/String.h"
#include "platform/health/HealthStore.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/contract/OwnProcess.h"
#include "tests/platform/EnvironmentScope.h"

// The start, and the wheelchair flag that is asked anew in the background, beside a health store that takes
// its time. The first question is asked once in a process, so each of these stands in a process of its own.
namespace ax {

namespace {

class HealthRefreshTest : public testing::Test {
 protected:
  void SetUp() override {
    bundle_ = openBundle();
    ASSERT_NE(bundle_, nullptr);
  }
  void TearDown() override { setWheelchairAnswer(nullptr); }

  // From several threads, this one among them.
  void startFromEverywhere() {
    std::vector<std::thread> threads;
    for (int i = 0; i < 4; ++i) threads.emplace_back([this] { bundle_->start(); });
    bundle_->start();
    for (std::thread& thread : threads) thread.join();
    EXPECT_EQ(ValidationManager::sharedInstance()->starts(), 1u);
  }

  static bool speaksOfAWheelchair() {
    const auto describe =
        exported<Ref<String>(double, double, double, bool)>("accessibilityDescriptionForPercentages");
    return describe(0, 0, 0, false)->contains("Roll hours");
  }

  // What the screens go on with while the store makes up its mind.
  static void expectAsLongAsItIsAsked(bool wheelchair) {
    for (int i = 0; i < 20; ++i) EXPECT_EQ(speaksOfAWheelchair(), wheelchair);
  }

  std::unique_ptr<LoadedBundle> bundle_;
  const EnvironmentScope environment_{Environment{}};
};

TEST_F(HealthRefreshTest, NobodyWaitsForASlowStore) {
  if (ranInOwnProcess()) return;
  std::promise<void> late;
  std::atomic<bool> isFirst = true;
  setWheelchairAnswer([&isFirst, waits = late.get_future().share()] {
    if (isFirst.exchange(false)) return WheelchairUse::no;
    waits.wait();
    return WheelchairUse::yes;
  });
  startFromEverywhere();
  expectAsLongAsItIsAsked(false);
  late.set_value();
  waitForBackgroundTasks();
  EXPECT_TRUE(speaksOfAWheelchair());
  waitForBackgroundTasks();
}

TEST_F(HealthRefreshTest, WhatFailsInTheBackgroundChangesNothing) {
  if (ranInOwnProcess()) return;
  const std::size_t failedBefore = failedBackgroundTasks();
  std::atomic<int> asked = 0;
  setWheelchairAnswer([&asked] {
    const int before = asked++;
    if (before > 0 && before % 2 == 0) throw std::runtime_error("the store is locked");
    return before == 0 ? WheelchairUse::yes : WheelchairUse::error;
  });
  startFromEverywhere();
  expectAsLongAsItIsAsked(true);
  waitForBackgroundTasks();
  EXPECT_TRUE(speaksOfAWheelchair());
  waitForBackgroundTasks();
  EXPECT_EQ(failedBackgroundTasks() - failedBefore, 10u);
}

using HealthRefreshDeathTest = HealthRefreshTest;

TEST_F(HealthRefreshDeathTest, TheAppEndsBeforeTheStoreAnswers) {
  if (ranInOwnProcess()) return;
  GTEST_FLAG_SET(death_test_style, "threadsafe");
  const auto endWhileAsked = [this] {
    setWheelchairAnswer([] {
      std::this_thread::sleep_for(std::chrono::milliseconds(100));
      return WheelchairUse::yes;
    });
    startFromEverywhere();
    const bool isKnown = speaksOfAWheelchair() && speaksOfAWheelchair();
    std::exit(isKnown ? EXIT_SUCCESS : EXIT_FAILURE);
  };
  EXPECT_EXIT(endWhileAsked(), testing::ExitedWithCode(EXIT_SUCCESS), "^$");
}

}  // namespace

}  // namespace ax
