#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <thread>

#include "platform/accessibility/ValidationManager.h"
#include "platform/foundation/Array.h"
#include "platform/runtime/Message.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/contract/OwnProcess.h"
#include "tests/platform/EnvironmentScope.h"

// A bundle starts once in a process, so each of these stands in a process of its own.
namespace ax {

namespace {

class StartUpTest : public testing::Test {
 protected:
  void SetUp() override {
    bundle_ = openBundle();
    ASSERT_NE(bundle_, nullptr);
  }

  bool isInstalled(std::string_view category) const {
    const auto& requests = manager_->installationRequests();
    return std::any_of(requests.begin(), requests.end(), [&](const InstallationRequest& request) {
      return request.category == category && request.installed;
    });
  }

  bool hasFailed(std::string_view check) const {
    const std::vector<ContractCheck> failed = manager_->failedChecks();
    return std::any_of(failed.begin(), failed.end(),
                       [&](const ContractCheck& found) { return found.description() == check; });
  }

  const Ref<ValidationManager> manager_ = ValidationManager::sharedInstance();
  std::unique_ptr<LoadedBundle> bundle_;
};

TEST_F(StartUpTest, AsksForEveryCategoryOnceAndInOrder) {
  if (ranInOwnProcess()) return;
  bundle_->start();
  const auto& requests = manager_->installationRequests();
  ASSERT_EQ(requests.size(), categoryCount());
  EXPECT_EQ(requests[0].category, "CHWorkoutsListSummaryTableViewCellAccessibility");
  EXPECT_EQ(requests[30].category, "_CHWorkoutDetailWeatherViewAccessibility");
  EXPECT_EQ(requests[58].category, "MonthDayCellLayerAccessibility");
  EXPECT_EQ(requests.back().category, "AX_VeltoNSStringAccessibility");
  std::set<std::string> names;
  for (const InstallationRequest& request : requests) {
    EXPECT_TRUE(request.canInteractWithTargetClass) << request.category;
    EXPECT_TRUE(names.insert(request.category).second) << request.category;
  }
  EXPECT_EQ(manager_->validationTargetName(), "AX Velto");
  EXPECT_EQ(manager_->overrideProcessName(), "AX Velto");
  EXPECT_FALSE(manager_->isDebugBuild());

  const std::size_t checks = manager_->checks().size();
  bundle_->start();
  EXPECT_EQ(manager_->starts(), 1u);
  EXPECT_EQ(manager_->installationRequests().size(), categoryCount());
  EXPECT_EQ(manager_->checks().size(), checks);
}

TEST_F(StartUpTest, ChecksTheHostBeforeTheCategoriesAndNamesNoFurtherBundles) {
  if (ranInOwnProcess()) return;
  const Message<Ref<Array>()> accessibilityBundles{"accessibilityBundles"};
  EXPECT_EQ(accessibilityBundles(bundle_->principalClass()), nullptr);
  EXPECT_EQ(manager_->starts(), 0u) << "asking starts nothing";

  bundle_->start();
  const std::vector<ContractCheck>& checks = manager_->checks();
  ASSERT_GT(checks.size(), 3u);
  const char* const ofTheHost[] = {"Calendar has class method qs_gregorianCalendarWithUTCTimeZone",
                                   "ActivitySummaryCache has instance method activitySummaryForCacheIndex:",
                                   "ActivitySummary has instance method _exerciseTimeCompletionPercentage"};
  for (int i = 0; i < 3; ++i) {
    EXPECT_EQ(checks[i].description(), ofTheHost[i]);
    EXPECT_EQ(checks[i].category, "");
    EXPECT_TRUE(checks[i].passed) << checks[i].found;
  }
  EXPECT_NE(checks[3].category, "");
}

TEST_F(StartUpTest, GoesOnWhenTheHostLacksWhatTheBundleNames) {
  if (ranInOwnProcess()) return;
  ASSERT_NE(Class::named("ActivitySummaryCache"), nullptr);
  Class::named("ActivitySummaryCache")->hide();
  Class::named("MonthWeekView")->hide();
  bundle_->start();
  EXPECT_TRUE(hasFailed("ActivitySummaryCache has instance method activitySummaryForCacheIndex:"));
  EXPECT_TRUE(hasFailed("MonthWeekView exists")) << "the day layers rely on their week rows";
  EXPECT_FALSE(isInstalled("MonthWeekViewAccessibility"));
  EXPECT_TRUE(isInstalled("MonthDayCellLayerAccessibility")) << "the one before it";
  EXPECT_TRUE(isInstalled("PaletteWeekdayHeaderViewAccessibility")) << "one after it";
  EXPECT_TRUE(isInstalled("AX_VeltoNSStringAccessibility")) << "the last";
}

TEST_F(StartUpTest, InstallsWithoutChecksWhereChecksAreOff) {
  if (ranInOwnProcess()) return;
  const EnvironmentScope environment(Environment{.checks = false});
  bundle_->start();
  EXPECT_TRUE(manager_->checks().empty());
  EXPECT_EQ(manager_->installationRequests().size(), categoryCount());
  EXPECT_TRUE(isInstalled("AX_VeltoNSStringAccessibility"));
}

TEST_F(StartUpTest, EveryThreadReturnsAfterTheOneStart) {
  if (ranInOwnProcess()) return;
  std::vector<std::thread> threads;
  std::vector<std::size_t> seen(4);
  for (std::size_t& requests : seen) {
    threads.emplace_back([&] {
      bundle_->start();
      requests = manager_->installationRequests().size();
    });
  }
  for (std::thread& thread : threads) thread.join();
  EXPECT_EQ(seen, std::vector<std::size_t>(4, categoryCount()));
  EXPECT_EQ(manager_->starts(), 1u);
}

}  // namespace

}  // namespace ax
