#include <gtest/gtest.h>

#include <algorithm>
#include <numeric>
#include <random>
#include <set>

#include "host/calendar/ActivityTappableDay.h"
#include "host/calendar/MonthWeekView.h"
#include "host/calendar/QSCalendarDayCell.h"
#include "platform/runtime/Number.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/GivenSummaries.h"
#include "tests/bundle/Members.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

// The rows of the month: their order over many layouts, days that move, and days that go by.
namespace ax {

namespace {

constexpr double now = 1773144000;  // noon of Tuesday, 10 March 2026, in UTC
constexpr double day = 86400;

class WeekRowTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  static Ref<host::MonthDayCellLayer> dayAt(double time, Rect frame = {}) {
    const auto made = make<host::MonthDayCellLayer>();
    made->setDate(date(time));
    made->setFrame(frame);
    return made;
  }

  const EnvironmentScope environment_{Environment{.locale = "en_US", .timeZone = "UTC", .now = now}};
  const Ref<host::MonthWeekView> week_ = make<host::MonthWeekView>();
};

// Days on a grid, added in any order, must be listed row by row in the direction of the language.
TEST_F(WeekRowTest, ListsItsDaysInTheOrderOfTheScreen) {
  std::mt19937 random(42);
  for (int i = 0; i < 60; ++i) {
    const bool leftward = i % 2 == 1;
    const EnvironmentScope language(Environment{.locale = leftward ? "ar_EG" : "en_US", .now = now});
    const auto week = make<host::MonthWeekView>();
    week->setFrame({0, static_cast<double>(random() % 500), 350, 300});
    std::vector<Ref<Object>> expected;
    for (int row = 0; row < 3; ++row) {
      for (int column = 0; column < 7; ++column) {
        const int x = leftward ? 6 - column : column;
        expected.push_back(dayAt(now, {x * 50.0, row * 110.0, 30, 30}));
      }
    }
    std::vector<Ref<Object>> added = expected;
    std::shuffle(added.begin(), added.end(), random);
    for (const Ref<Object>& layer : added) week->layer()->addSublayer(cast<Layer>(layer));
    EXPECT_EQ(messages::accessibilityElements(week)->items(), expected) << i;
  }
}

TEST_F(WeekRowTest, OrdersAnewWhenThingsMove) {
  const auto first = dayAt(now, {0, 50, 30, 30});
  const auto second = dayAt(now + day, {50, 50, 30, 30});
  week_->layer()->addSublayer(first);
  week_->layer()->addSublayer(second);
  EXPECT_TRUE(messages::accessibilityElements(week_)->isEqual(*array({first, second})));
  first->setFrame({0, 250, 30, 30});
  EXPECT_TRUE(messages::accessibilityElements(week_)->isEqual(*array({second, first})));
}

TEST_F(WeekRowTest, MakesItsDaysItsOwnWhenItListsThem) {
  const auto layer = dayAt(now);
  const auto other = make<View>();
  messages::setAccessibilityContainer(layer, other);
  week_->layer()->addSublayer(layer);
  EXPECT_EQ(labelOf(layer), "Today, Tuesday") << "no row has listed it yet";
  messages::accessibilityElements(week_);
  EXPECT_EQ(messages::accessibilityContainer(layer), week_);
  EXPECT_EQ(labelOf(layer), "Today, March 10");
  const auto refined = make<host::QSCalendarDayCell>();
  week_->layer()->addSublayer(refined);
  EXPECT_EQ(messages::accessibilityElements(week_)->count(), 1u) << "a day of another kind is none of its";
}

TEST_F(WeekRowTest, GoesOnWithoutATitleThatRaises) {
  week_->setMonthTitleView(make<host::VeltoMonthTitleLabel>());
  week_->layer()->addSublayer(dayAt(now));
  ASSERT_TRUE(setScriptedAnswer(*week_, "monthTitleView"_key,
                                [](auto) -> Ref<Object> { throw std::runtime_error("no title"); }));
  EXPECT_EQ(messages::accessibilityElements(week_)->count(), 1u);
}

// Midnight in the reader's zone turns tomorrow into today, whatever the clocks do on the way.
TEST_F(WeekRowTest, ADayBecomesTodayAtItsMidnight) {
  const struct {
    const char* zone;
    double midnight;
  } cases[] = {{"UTC", 1772928000},               // 8 March 2026
               {"America/New_York", 1772946000},  // the clocks go forward two hours later
               {"America/New_York", 1793505600},  // and back, on 1 November
               {"America/Havana", 1772946000},    // they go forward at midnight itself
               {"Asia/Kathmandu", 1772907300},
               {"Pacific/Kiritimati", 1772877600}};
  for (const auto& [zone, midnight] : cases) {
    const auto layer = dayAt(midnight + 60);
    for (const double seconds : {-0.5, 0.0, 80000.0}) {
      const EnvironmentScope there(Environment{.timeZone = zone, .now = midnight + seconds});
      EXPECT_EQ(labelOf(layer).starts_with("Today"), seconds >= 0) << zone << ' ' << seconds;
      EXPECT_EQ(layer->isFutureDay(), seconds < 0) << zone << ' ' << seconds;
    }
  }
}

TEST_F(WeekRowTest, AFutureDayHasNoDataYet) {
  const auto layer = dayAt(now + day);
  GivenSummaries summaries;
  summaries.give(20523, 1, 1, 1);
  setMember(*layer, "_hasWorkout", number(true));
  EXPECT_EQ(valueOf(layer), "No data");
  const EnvironmentScope tomorrow(Environment{.now = now + day});
  EXPECT_EQ(valueOf(layer), "Worked out, All goals completed");
  GivenSummaries::take(20523);
  EXPECT_EQ(valueOf(layer), "Worked out");
}

TEST_F(WeekRowTest, TitlesNameTheirMonthInEveryLanguage) {
  for (const char* locale : localesOfAllLanguages) {
    const EnvironmentScope language(Environment{.locale = locale, .now = now});
    std::set<std::string> names;
    for (int month = 1; month <= 12; ++month) {
      const auto title = make<host::VeltoMonthTitleLabel>();
      title->setText(string((month < 10 ? "0" : "") + std::to_string(month)));
      names.insert(labelOf(title));
      EXPECT_NE(messages::accessibilityTraits(title) & TraitHeader, 0u);
    }
    EXPECT_EQ(names.size(), 12u) << locale;
    EXPECT_FALSE(names.contains("(none)")) << locale;
  }
}

TEST_F(WeekRowTest, ATappableDayIsSelectedByItsFullCircleAlone) {
  const auto tappable = make<host::WeekPaletteTappableDay>();
  EXPECT_EQ(messages::accessibilityTraits(tappable), TraitButton);
  const auto circle = make<View>();
  ASSERT_FALSE(tappable->isa().instanceVariable("_circle"_key)->write(*tappable, circle)) << "no layer";
  const auto layer = make<Layer>();
  setMember(*tappable, "_circle", layer);
  for (const double opacity : {0.0, 0.99, std::nextafter(1.0, 0.0), 1.0, std::nextafter(1.0, 2.0)}) {
    layer->setOpacity(opacity);
    const bool isSelected = (messages::accessibilityTraits(tappable) & TraitSelected) != 0;
    EXPECT_EQ(isSelected, opacity == 1) << opacity;
  }
}

}  // namespace

}  // namespace ax
