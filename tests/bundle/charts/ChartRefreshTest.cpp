#include <gtest/gtest.h>

#include <functional>

#include "host/charts/ActivityMoveAndExerciseChartView.h"
#include "host/charts/ActivityStandChartView.h"
#include "host/charts/TrendDetailChartView.h"
#include "host/charts/TrendDetailDailyAverageView.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "platform/runtime/Value.h"
#include "platform/toolkit/DataSeriesMessages.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/Members.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

// What all charts of bars have in common: lists that are kept, renewed and dropped.
namespace ax {

namespace {

constexpr double now = 1780000000;

Ref<Array> listOf(std::size_t count, const std::function<Ref<Object>(double)>& item) {
  Array::Items items;
  for (std::size_t i = 0; i < count; ++i) items.push_back(item(static_cast<double>(i)));
  return array(std::move(items));
}
Ref<Object> barPoint(double i) {
  return point(i, i);
}
Ref<Object> barStop(double i) {
  return number(i * 10);
}

// One of the four charts, and how the host hands it its bars.
struct ChartOfBars {
  const char* name;
  std::function<Ref<View>()> make;
  std::function<void(View&, Ref<Array>)> give;
  Ref<Object> (*bar)(double);
  std::size_t titles;  // how many elements it has without bars
};

// Where the class has the method; the others do without.
void answer(Object& chart, const char* method, const std::function<Ref<Object>()>& reply) {
  setScriptedAnswer(chart, Selector::intern(method), [reply](auto) { return reply(); });
}

template <class T, auto Give>
ChartOfBars chartOfBars(Ref<Object> (*bar)(double), bool hasTitle) {
  const auto made = [=] {
    const auto chart = make<T>();
    chart->setFrame({0, 0, 70, 100});
    if constexpr (requires { chart->setTitleLabel(nullptr); }) {
      if (hasTitle) chart->setTitleLabel(make<Label>());
      chart->setAccessibilityUnit(Unit::kilocalorieUnit());
    }
    answer(*chart, "accessibilityQuantityForIndex:", [] { return quantity(5, Unit::kilocalorieUnit()); });
    answer(*chart, "accessibilityDateIntervalForIndex:", [] {
      return make<DateInterval>(date(now), date(now + 86400));
    });
    return Ref<View>(chart);
  };
  return {T::staticClass().name().c_str(), made,
          [](View& chart, Ref<Array> bars) { (static_cast<T&>(chart).*Give)(std::move(bars)); }, bar,
          hasTitle ? 1u : 0u};
}

class ChartRefreshTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  static std::vector<ChartOfBars> charts() {
    using namespace host;
    using Move = ActivityMoveAndExerciseChartView;
    return {
        chartOfBars<Move, &Move::setMoveAndExerciseChartPoints>(barPoint, false),
        chartOfBars<ActivityStandChartView, &ActivityStandChartView::setStandChartPoints>(barPoint, false),
        chartOfBars<TrendDetailChartView, &TrendDetailChartView::setBarStops>(barStop, true),
        chartOfBars<TrendDetailDailyAverageView, &TrendDetailDailyAverageView::setDayStops>(barStop, true)};
  }

  const Message<Ref<Array>()> graphData_{"_accessibilityGraphData"};
  const EnvironmentScope environment_{
      Environment{.locale = "en_US", .timeZone = "America/Sao_Paulo", .now = now}};
};

TEST_F(ChartRefreshTest, AnswersFromItsCopyUntilItIsLoadedAgain) {
  for (const ChartOfBars& kind : charts()) {
    const Ref<View> chart = kind.make();
    EXPECT_EQ(graphData_(chart), nullptr) << kind.name;
    const Ref<Array> bars = listOf(7, kind.bar);
    kind.give(*chart, bars);
    EXPECT_EQ(graphData_(chart), nullptr) << kind.name;
    load(chart);
    EXPECT_EQ(graphData_(chart), bars) << kind.name;
    const Ref<Array> elements = messages::accessibilityElements(chart);
    EXPECT_EQ(messages::accessibilityElements(chart), elements) << kind.name;

    kind.give(*chart, listOf(3, kind.bar));
    EXPECT_EQ(graphData_(chart), bars) << kind.name;
    EXPECT_EQ(messages::accessibilityElements(chart), elements) << kind.name;
    load(chart);
    EXPECT_EQ(graphData_(chart)->count(), 3u) << kind.name;
    EXPECT_NE(messages::accessibilityElements(chart), elements) << kind.name;
  }
}

// The first of the list decides, and nothing is left of the bars before.
TEST_F(ChartRefreshTest, HasNoBarsOfAnUnusableList) {
  for (const ChartOfBars& kind : charts()) {
    const Ref<Object> stranger = string("bar");
    const Ref<Array> strangersFirst = array({stranger, kind.bar(0), kind.bar(1)});
    for (const Ref<Array>& bars : {Ref<Array>(), array({}), strangersFirst}) {
      const Ref<View> chart = kind.make();
      kind.give(*chart, listOf(7, kind.bar));
      load(chart);
      messages::accessibilityElements(chart);
      kind.give(*chart, bars);
      load(chart);
      EXPECT_EQ(graphData_(chart), nullptr) << kind.name;
      const Ref<Array> elements = messages::accessibilityElements(chart);
      EXPECT_EQ(elements->count(), kind.titles) << kind.name;
      EXPECT_EQ(messages::accessibilityElements(chart), elements) << kind.name << ": empty is an answer too";
    }
    const Ref<View> chart = kind.make();
    kind.give(*chart, array({kind.bar(0), stranger}));
    load(chart);
    EXPECT_EQ(graphData_(chart)->count(), 2u) << kind.name;
  }
}

TEST_F(ChartRefreshTest, EndsThoughItsElementsAreHeld) {
  for (const ChartOfBars& kind : charts()) {
    Ref<View> chart = kind.make();
    kind.give(*chart, listOf(7, kind.bar));
    load(chart);
    const Weak<View> weak = chart;
    const Weak<Array> copy = graphData_(chart);
    const Ref<Array> elements = messages::accessibilityElements(chart);
    ASSERT_GT(elements->count(), kind.titles) << kind.name;
    std::vector<std::string> spoken;
    for (const Ref<Object>& element : *elements) spoken.push_back(labelOf(element));
    chart = nullptr;
    EXPECT_FALSE(weak) << kind.name;
    EXPECT_FALSE(copy) << kind.name;
    for (std::size_t i = 0; i < elements->count(); ++i) {
      EXPECT_EQ(messages::accessibilityContainer(elements->at(i)), nullptr) << kind.name;
      EXPECT_EQ(labelOf(elements->at(i)), spoken[i]) << kind.name;
    }
  }
}

TEST_F(ChartRefreshTest, SpeaksTheLanguageAndTheDayOfItsLastRefresh) {
  const auto chart = make<host::ActivityStandChartView>();
  chart->setStandChartPoints(listOf(24, barPoint));
  load(chart);
  const Ref<Object> noon = messages::accessibilityElements(chart)->at(12);
  const std::string english = labelOf(noon);
  const EnvironmentScope japanese(
      Environment{.locale = "ja_JP", .timeZone = "America/Sao_Paulo", .now = now});
  EXPECT_EQ(labelOf(messages::accessibilityElements(chart)->at(12)), english);
  load(chart);
  EXPECT_NE(labelOf(messages::accessibilityElements(chart)->at(12)), english);
  EXPECT_EQ(labelOf(noon), english) << "an element that somebody kept stays what it was";
}

TEST_F(ChartRefreshTest, MovesItsElementsWithIt) {
  for (const ChartOfBars& kind : charts()) {
    const Ref<View> chart = kind.make();
    kind.give(*chart, listOf(7, kind.bar));
    load(chart);
    const Ref<Array> elements = messages::accessibilityElements(chart);
    const auto page = make<View>();
    page->setFrame({100, 1000, 300, 300});
    ASSERT_GT(elements->count(), kind.titles) << kind.name;
    std::vector<Rect> before;
    for (std::size_t i = kind.titles; i < elements->count(); ++i)
      before.push_back(messages::accessibilityFrame(elements->at(i)));
    page->addSubview(chart);
    for (std::size_t i = kind.titles; i < elements->count(); ++i) {
      EXPECT_EQ(messages::accessibilityFrame(elements->at(i)), before[i - kind.titles].movedBy({100, 1000}))
          << kind.name;
    }
  }
}

// The bars share the width from left to right: each begins where the one before it ends, or later.
TEST_F(ChartRefreshTest, SetsTheBarsOfADaySideBySide) {
  for (const double width : {1.0, 63.0, 64.0, 320.5, 1024.0}) {
    for (const std::size_t count : {8, 24, 25}) {
      const auto stand = make<host::ActivityStandChartView>();
      stand->setFrame({0, 0, width, 40.9});
      stand->setStandChartPoints(listOf(count, barPoint));
      load(stand);
      const Ref<Array> elements = messages::accessibilityElements(stand);
      ASSERT_EQ(elements->count(), count);
      double end = 0;
      for (const Ref<Object>& element : *elements) {
        const Rect frame = messages::accessibilityFrame(element);
        EXPECT_EQ(frame.x, end) << width << " in " << count;
        EXPECT_EQ(frame.height, 40);
        end = frame.maxX();
      }
      EXPECT_GE(end, width) << "the whole width can be touched";
    }
  }
}

}  // namespace

}  // namespace ax
