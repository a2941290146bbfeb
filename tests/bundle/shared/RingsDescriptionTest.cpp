#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <stdexcept>

#include "host/core/ActivitySummaryCache.h"
#include "platform/foundation/AttributedString.h"
#include "platform/foundation/BackgroundQueue.h"
#include "platform/health/HealthStore.h"
#include "platform/runtime/Message.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "tests/bundle/GivenSummaries.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/contract/OwnProcess.h"
#include "tests/platform/EnvironmentScope.h"

// What a scene cannot show of the rings: fractions that no file can write, what is asked when, and hosts that
// raise.
namespace ax {

namespace {

constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();
constexpr double endless = std::numeric_limits<double>::infinity();

std::string textOf(const Ref<String>& text) {
  return text ? text->text() : "(nil)";
}

class RingsDescriptionTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  static std::string describe(double move, double exercise, double stand, bool capped) {
    const auto describe =
        exported<Ref<String>(double, double, double, bool)>("accessibilityDescriptionForPercentages");
    return textOf(describe(move, exercise, stand, capped));
  }

  // What the stand ring is called at this moment.
  static std::string standWord() {
    const std::string text = describe(0, 0, 0, false);
    return text.find("Roll hours") != std::string::npos ? "roll" : "stand";
  }

  static Environment environmentWith(bool screenReader, WheelchairUse wheelchair) {
    return Environment{.screenReader = screenReader, .wheelchair = wheelchair};
  }
};

TEST_F(RingsDescriptionTest, CountsWhatIsNoFractionAsNothing) {
  const std::string nothing = "Calories burned, 0%, Exercise minutes, 0%, Stand hours, 0%";
  EXPECT_EQ(describe(-1, notANumber, -endless, false), nothing);
  EXPECT_EQ(describe(-1, notANumber, -endless, true), nothing);
  EXPECT_EQ(describe(notANumber, 1, 1, true),
            "Calories burned, 0%, Exercise minutes, Goal completed, Stand hours, Goal completed");
  EXPECT_EQ(describe(std::nextafter(1.0, 0.0), 1, 1, true),
            "Calories burned, 100%, Exercise minutes, Goal completed, Stand hours, Goal completed")
      << "only exactly the goal completes it";
}

class WheelchairTest : public RingsDescriptionTest {
 protected:
  const EnvironmentScope environment_{Environment{}};
};

TEST_F(WheelchairTest, IsAskedFirstWhenTheScreenReaderRunsAndThenInTheBackground) {
  if (ranInOwnProcess()) return;
  setEnvironment(environmentWith(false, WheelchairUse::yes));
  EXPECT_EQ(standWord(), "stand");
  EXPECT_EQ(wheelchairQueries(), 0u) << "nobody listens";

  setEnvironment(environmentWith(true, WheelchairUse::yes));
  EXPECT_EQ(standWord(), "roll") << "the first answer is waited for";
  EXPECT_EQ(wheelchairQueries(), 1u);

  waitForBackgroundTasks();
  setEnvironment(environmentWith(true, WheelchairUse::no));
  EXPECT_EQ(standWord(), "roll") << "later answers are not waited for";
  waitForBackgroundTasks();
  EXPECT_EQ(wheelchairQueries(), 2u);

  setEnvironment(environmentWith(false, WheelchairUse::yes));
  EXPECT_EQ(standWord(), "stand") << "but serve later calls";
  EXPECT_EQ(wheelchairQueries(), 2u);
}

TEST_F(WheelchairTest, KeepsWhatItKnowsWhenTheStoreFails) {
  if (ranInOwnProcess()) return;
  setEnvironment(environmentWith(true, WheelchairUse::error));
  EXPECT_EQ(standWord(), "stand");
  setEnvironment(environmentWith(true, WheelchairUse::yes));
  EXPECT_EQ(standWord(), "stand") << "the first question is used up";
  waitForBackgroundTasks();
  setEnvironment(environmentWith(true, WheelchairUse::error));
  EXPECT_EQ(standWord(), "roll");
  waitForBackgroundTasks();
  setEnvironment(environmentWith(true, WheelchairUse::unknown));
  EXPECT_EQ(standWord(), "roll") << "the failure changed nothing";
  waitForBackgroundTasks();
  setEnvironment(environmentWith(false, WheelchairUse::yes));
  EXPECT_EQ(standWord(), "stand") << "an unknown setting is no wheelchair";
}

TEST_F(RingsDescriptionTest, EveryObjectKeepsOneOfItsOwn) {
  const Message<Ref<String>()> description{"_accessibilityRingsDescription"};
  const Message<void(Ref<String>)> setDescription{"_accessibilitySetRingsDescription:"};
  const Ref<Object> day = make<Object>();
  EXPECT_EQ(description(day), nullptr);
  setDescription(day, string("half"));
  EXPECT_EQ(textOf(description(day)), "half");
  EXPECT_EQ(description(make<Object>()), nullptr);
  setDescription(day, nullptr);
  EXPECT_EQ(description(day), nullptr);
}

class DayRingsTest : public RingsDescriptionTest {
 protected:
  static Ref<String> rings(const Ref<Date>& day) {
    return exported<Ref<String>(const Ref<Date>&, bool)>("accessibilityVeltoStringForDate")(day, true);
  }
  static std::int64_t dayIndex(const Ref<Date>& day) {
    return exported<std::int64_t(const Ref<Date>&)>("CHCacheIndexForDate")(day);
  }
  Ref<ActivitySummary> summary(double move, double exercise, double stand) {
    return summaries_.give(dayIndex(day_), move, exercise, stand);
  }

  static inline const Ref<Date> day_ = date(-86400.0 * 10);
  GivenSummaries summaries_;
};

TEST_F(DayRingsTest, AreThoseOfTheLocalDayOnBothSidesOfTheEpoch) {
  const EnvironmentScope east(Environment{.timeZone = "Asia/Tokyo"});
  EXPECT_EQ(dayIndex(date(0)), 0);
  EXPECT_EQ(dayIndex(date(-9 * 3600)), 0);
  EXPECT_EQ(dayIndex(date(-9 * 3600 - 1)), -1);
  EXPECT_EQ(dayIndex(date(1772884800)), 20519) << "21:00 on 7 March 2026";
  EXPECT_EQ(dayIndex(date(1772884800 + 3 * 3600)), 20520);
}

TEST_F(DayRingsTest, SayNothingOfADayThatHasNone) {
  EXPECT_EQ(rings(day_), nullptr);
  EXPECT_EQ(rings(nullptr), nullptr);
  summary(0.5, 0.25, 0);
  EXPECT_EQ(textOf(rings(day_)), "Calories burned, 50%, Exercise minutes, 25%, Stand hours, 0%");
  const double bad[] = {-0.1, notANumber};
  for (const double fraction : bad) {
    summary(fraction, 1, 1);
    EXPECT_EQ(rings(day_), nullptr);
    summary(1, fraction, 1);
    EXPECT_EQ(rings(day_), nullptr);
    summary(1, 1, fraction);
    EXPECT_EQ(rings(day_), nullptr);
  }
}

TEST_F(DayRingsTest, AreNotOfTheFirstDayWhenThereIsNoDate) {
  const EnvironmentScope utc(Environment{.timeZone = "UTC"});
  summaries_.give(0, 1, 1, 1);
  EXPECT_EQ(textOf(rings(date(0))), "All goals completed");
  EXPECT_EQ(rings(nullptr), nullptr);
}

TEST_F(DayRingsTest, AbsorbWhatTheHostRaises) {
  if (ranInOwnProcess()) return;
  const ScriptedAnswer raise = [](auto) -> Ref<Object> { throw std::runtime_error("no activity"); };
  const Ref<ActivitySummary> day = summary(0.5, 0.5, 0.5);
  setScriptedAnswer(*day,
                    selectorFromString("accessibilityDescriptionForPercentages:exercisingPercentage:"
                                       "standingPercentage:arePercentagesCapped:"),
                    raise);
  EXPECT_EQ(rings(day_), nullptr);
  summary(0.5, 0.5, 0.5);
  const auto cache = host::ActivitySummaryCache::sharedInstance();
  setScriptedAnswer(*cache, selectorFromString("activitySummaryForCacheIndex:"), raise);
  EXPECT_EQ(rings(day_), nullptr);
}

}  // namespace

}  // namespace ax
