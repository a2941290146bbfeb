#include <gtest/gtest.h>

#include <algorithm>
#include <chrono>
#include <cmath>
#include <random>

#include "platform/foundation/Calendar.h"
#include "platform/health/ActivitySummary.h"
#include "tests/platform/EnvironmentScope.h"

// The days of activity over two centuries and many zones, reckoned once more with the standard library.
namespace ax {

namespace {

constexpr const char* zones[] = {"UTC",
                                 "America/New_York",
                                 "America/Havana",
                                 "America/Sao_Paulo",
                                 "Europe/Dublin",
                                 "Africa/Casablanca",
                                 "Asia/Kathmandu",
                                 "Asia/Tehran",
                                 "Australia/Lord_Howe",
                                 "Pacific/Apia",
                                 "Pacific/Chatham",
                                 "Pacific/Kiritimati"};

std::int64_t indexOf(double time) {
  return cacheIndexFromDateComponents(
      activityCacheDateComponentsFromDate(date(time), Calendar::currentCalendar()));
}

// From 1900 to 2100.
double someTime(std::mt19937& random) {
  return -2208988800.0 + static_cast<double>(random() % 200) * 31556952 + random() % 31556952 +
         static_cast<double>(random() % 1000) / 1000;
}

class ActivityDaysTest : public testing::TestWithParam<const char*> {
 protected:
  const EnvironmentScope environment_{Environment{.timeZone = GetParam(), .now = 0}};
  const Ref<Calendar> calendar_ = Calendar::currentCalendar();
  std::mt19937 random_{20260308};
};

TEST_P(ActivityDaysTest, CountTheDaysOfTheLocalCalendar) {
  using namespace std::chrono;
  for (int i = 0; i < 1000; ++i) {
    const double time = someTime(random_);
    const Ref<DateComponents> local = calendar_->componentsFromDate(*date(time));
    const auto day = sys_days(year(local->year) / local->month / local->day);
    ASSERT_EQ(indexOf(time), day.time_since_epoch().count()) << time;
    ASSERT_EQ(calendar_->weekdayOfDate(*date(time)), static_cast<int>(weekday(day).c_encoding()) + 1);
  }
}

TEST_P(ActivityDaysTest, BeginAtTheirFirstMoment) {
  for (int i = 0; i < 500; ++i) {
    const double time = someTime(random_);
    const Ref<Date> start = calendar_->startOfDayForDate(*date(time));
    const double begins = start->timeIntervalSince1970();
    ASSERT_LE(begins, time);
    ASSERT_LT(time - begins, 25.5 * 3600) << "the longest day";
    ASSERT_EQ(indexOf(begins), indexOf(time));
    ASSERT_LT(indexOf(begins - 0.001), indexOf(time));
    ASSERT_TRUE(calendar_->startOfDayForDate(*start)->isEqual(*start));
  }
}

TEST_P(ActivityDaysTest, NeverRunBackward) {
  double time = someTime(random_);
  std::int64_t index = indexOf(time);
  int leaps = 0;
  for (int i = 0; i < 3000; ++i) {
    time += random_() % 80000;
    const std::int64_t next = indexOf(time);
    ASSERT_GE(next, index) << time;
    leaps += next > index + 1;
    index = next;
  }
  EXPECT_LE(leaps, 1) << "but for a day that a zone left out";
}

TEST_P(ActivityDaysTest, AreSetOffFromTheClockByTheSummerTimeAlone) {
  for (int i = 0; i < 500; ++i) {
    const Ref<Date> moment = date(std::floor(someTime(random_)));
    const TimeInterval offset = calendar_->daylightSavingTimeOffsetForDate(*moment);
    ASSERT_LE(std::abs(offset), 2 * 3600) << moment->timeIntervalSince1970();
    ASSERT_TRUE(offset == 0 || GetParam() != std::string("UTC"));
  }
}

INSTANTIATE_TEST_SUITE_P(Zones, ActivityDaysTest, testing::ValuesIn(zones), [](const auto& zone) {
  std::string name = zone.param;
  std::replace(name.begin(), name.end(), '/', '_');
  return name;
});

}  // namespace

}  // namespace ax
