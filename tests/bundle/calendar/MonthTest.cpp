#include <gtest/gtest.h>

#include "host/calendar/MonthViewController.h"
#include "host/calendar/MonthWeekView.h"
#include "host/calendar/QSCalendarDayCell.h"
#include "platform/formatting/FormatterStatistics.h"
#include "platform/toolkit/ElementTree.h"
#include "tests/bundle/GivenSummaries.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

// What a scene cannot show of the month screen: tags that are never spoken, and what a month costs.
namespace ax {

namespace {

constexpr double today = 1773144000;  // noon of 2026-03-10 in UTC
constexpr double day = 86400;

class MonthTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  const EnvironmentScope environment_{Environment{.locale = "de_DE", .now = today}};
  GivenSummaries summaries_;
};

// Six week rows whose last day is today, every day of them with rings.
std::vector<Ref<View>> sixWeeks(GivenSummaries& summaries) {
  std::vector<Ref<View>> weeks;
  for (int i = 0; i < 42; ++i) {
    if (i % 7 == 0) {
      weeks.push_back(make<host::MonthWeekView>());
      weeks.back()->setFrame({0, 100.0 * i / 7, 350, 100});
    }
    const auto cell = make<host::MonthDayCellLayer>();
    cell->setDate(date(today - (41 - i) * day));
    summaries.give(static_cast<std::int64_t>(today / day) - (41 - i), 0.01 * i, 0.5, 1);
    weeks.back()->layer()->addSublayer(cell);
    weeks.back()->layoutSubviews();
  }
  return weeks;
}

std::vector<std::string> spoken(const std::vector<Ref<View>>& weeks) {
  std::vector<std::string> texts;
  for (const Ref<View>& week : weeks) {
    const Ref<Array> elements = messages::accessibilityElements(week);
    for (const Ref<Object>& element : *elements) {
      texts.push_back(messages::accessibilityLabel(element)->text() + ": " +
                      messages::accessibilityValue(element)->text());
    }
  }
  return texts;
}

TEST_F(MonthTest, MakesNoFormatterOnceItHasBeenRead) {
  const std::vector<Ref<View>> weeks = sixWeeks(summaries_);
  const std::vector<std::string> first = spoken(weeks);
  ASSERT_EQ(first.size(), 42u);
  EXPECT_EQ(first.front(),
            "28. Januar: Verbrannte Kalorien, 0\u00A0%, Trainingsminuten, 50\u00A0%, Stehstunden, Ziel "
            "erreicht");
  EXPECT_EQ(first.back(),
            "Heute, 10. März: Verbrannte Kalorien, 41\u00A0%, Trainingsminuten, 50\u00A0%, Stehstunden, "
            "Ziel erreicht");
  const std::uint64_t made = formatting::formattersMade();
  EXPECT_EQ(spoken(weeks), first);
  EXPECT_EQ(formatting::formattersMade(), made);
}

TEST_F(MonthTest, TagsItsScrollViewAgainAtEveryLoad) {
  const Ref<Object> controller = Class::named("MonthScrollViewController")->instantiate();
  messages::viewDidLoad(controller);
  const auto scrollView = make<ScrollView>();
  const InstanceVariable* variable = controller->isa().instanceVariable("_scrollView"_key);
  ASSERT_TRUE(variable->write(*controller, scrollView));
  EXPECT_EQ(accessibilityIdentification(scrollView), nullptr);
  messages::viewDidLoad(controller);
  ASSERT_NE(accessibilityIdentification(scrollView), nullptr);
  EXPECT_EQ(accessibilityIdentification(scrollView)->text(), "WorstScrollViewEver");
  EXPECT_NE(scrollView->superview(), nullptr) << "the host has run too";
  EXPECT_EQ(messages::accessibilityLabel(scrollView), nullptr) << "a tag is not spoken";
}

TEST_F(MonthTest, ForgetsAWeekRowThatIsGone) {
  const auto cell = make<host::MonthDayCellLayer>();
  cell->setDate(date(today));
  cell->setFrame({10, 10, 30, 30});
  {
    const auto week = make<host::MonthWeekView>();
    week->setFrame({0, 100, 350, 100});
    week->layer()->addSublayer(cell);
    ASSERT_EQ(messages::accessibilityElements(week)->count(), 1u);
    EXPECT_EQ(messages::accessibilityLabel(cell)->text(), "Heute, 10. März");
    EXPECT_EQ(messages::accessibilityFrame(cell), (Rect{0, 110, 50, 100}));
  }
  EXPECT_EQ(messages::accessibilityContainer(cell), nullptr);
  EXPECT_EQ(messages::accessibilityLabel(cell)->text(), "Heute, Dienstag");
  EXPECT_EQ(messages::accessibilityFrame(cell), (Rect{0, 10, 50, 100}));
}

}  // namespace

}  // namespace ax
