#include <gtest/gtest.h>

#include "host/charts/ActivityMoveAndExerciseChartView.h"
#include "host/charts/ActivityStandChartView.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "platform/runtime/Value.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

// What a scene cannot show of the day's charts: how often they ask the host, what a query in the middle of a
// build finds, and very long lists.
namespace ax {

namespace {

Ref<Array> points(std::size_t count, double y) {
  Array::Items items;
  for (std::size_t i = 0; i < count; ++i) items.push_back(point(static_cast<double>(i), y));
  return array(std::move(items));
}

class DayChartTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  const EnvironmentScope environment_{
      Environment{.locale = "en_GB", .timeZone = "Asia/Kolkata", .now = 1780000000}};
};

TEST_F(DayChartTest, AsksForThePointsOncePerRefreshAndForTheKindOncePerSpan) {
  const auto chart = make<host::ActivityMoveAndExerciseChartView>();
  int reads = 0;
  std::int64_t kind = 0;
  setScriptedAnswer(*chart, Selector::intern("moveAndExerciseChartPoints"), [&](auto) {
    ++reads;
    return Ref<Object>(points(8, 2));
  });
  setScriptedAnswer(*chart, Selector::intern("moveAndExerciseChartViewType"),
                    [&](auto) { return Ref<Object>(number(kind++ % 2)); });
  messages::_accessibilityLoadAccessibilityInformation(chart);
  const Ref<Array> elements = messages::accessibilityElements(chart);
  EXPECT_EQ(messages::accessibilityElements(chart), elements);
  EXPECT_EQ(reads, 1);
  EXPECT_EQ(kind, 8);
  ASSERT_EQ(elements->count(), 8u);
  EXPECT_EQ(valueOf(elements->at(0)), "2 calories");
  EXPECT_EQ(valueOf(elements->at(7)), "2 minutes");
}

TEST_F(DayChartTest, ShowsTheListThatGrowsToAQueryFromWithinItsBuild) {
  const auto chart = make<host::ActivityMoveAndExerciseChartView>();
  chart->setMoveAndExerciseChartPoints(points(24, 1));
  std::vector<std::size_t> seen;
  setScriptedAnswer(*chart, Selector::intern("moveAndExerciseChartViewType"), [&](auto) {
    seen.push_back(messages::accessibilityElements(chart)->count());
    return Ref<Object>(number(1));
  });
  messages::_accessibilityLoadAccessibilityInformation(chart);
  EXPECT_EQ(messages::accessibilityElements(chart)->count(), 8u);
  EXPECT_EQ(seen, (std::vector<std::size_t>{0, 1, 2, 3, 4, 5, 6, 7}));
}

TEST_F(DayChartTest, SumsInSinglePrecisionInOrder) {
  const auto chart = make<host::ActivityMoveAndExerciseChartView>();
  Array::Items items;
  // The first is so large that a float swallows each one after it.
  for (int i = 0; i < 24; ++i) items.push_back(point(i, i == 0 ? 16777216 : 1));
  chart->setMoveAndExerciseChartPoints(array(std::move(items)));
  messages::_accessibilityLoadAccessibilityInformation(chart);
  EXPECT_EQ(valueOf(messages::accessibilityElements(chart)->at(0)), "16,777,216 calories");
  EXPECT_EQ(valueOf(messages::accessibilityElements(chart)->at(1)), "3 calories");
}

TEST_F(DayChartTest, TakesTenThousandPoints) {
  const auto move = make<host::ActivityMoveAndExerciseChartView>();
  move->setMoveAndExerciseChartPoints(points(10007, 0.5));
  messages::_accessibilityLoadAccessibilityInformation(move);
  EXPECT_EQ(valueOf(messages::accessibilityElements(move)->at(7)), "625 calories");

  const auto stand = make<host::ActivityStandChartView>();
  stand->setFrame({0, 0, 10001, 40});
  stand->setStandChartPoints(points(10000, 1));
  messages::_accessibilityLoadAccessibilityInformation(stand);
  const Ref<Array> hours = messages::accessibilityElements(stand);
  ASSERT_EQ(hours->count(), 10000u);
  EXPECT_EQ(messages::accessibilityFrame(hours->at(9999)), (Rect{19998, 0, 2, 40}));
  EXPECT_EQ(labelOf(hours->at(24 * 400 + 5)), labelOf(hours->at(5)));
  EXPECT_NE(labelOf(hours->at(9999)), labelOf(hours->at(9999 % 24)));
}

}  // namespace

}  // namespace ax
