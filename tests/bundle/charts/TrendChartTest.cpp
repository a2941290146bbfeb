#include <gtest/gtest.h>

#include <cmath>
#include <functional>
#include <limits>
#include <vector>

#include "host/charts/TrendDetailChartView.h"
#include "host/charts/TrendDetailDailyAverageView.h"
#include "platform/runtime/Number.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "platform/toolkit/DataSeriesMessages.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

// What a scene cannot hold of a trend's charts: figures that no file can write, how the host is asked, and
// very many bars.
namespace ax {

namespace {

constexpr double nan = std::numeric_limits<double>::quiet_NaN();
constexpr double infinity = std::numeric_limits<double>::infinity();
constexpr double day = 86400;

using Answer = std::function<Ref<Object>(std::size_t)>;

void answer(Object& chart, std::string_view method, Answer reply) {
  ASSERT_TRUE(setScriptedAnswer(chart, Selector::intern(method), [reply = std::move(reply)](auto arguments) {
    return reply(static_cast<std::size_t>(cast<Number>(arguments[0].get())->int64Value()));
  }));
}

Ref<Array> stops(std::size_t count) {
  Array::Items items;
  for (std::size_t i = 0; i < count; ++i) items.push_back(number(static_cast<double>(i) * 10));
  return array(std::move(items));
}

Ref<Quantity> kilocalories(double value) {
  return quantity(value, Unit::kilocalorieUnit());
}

std::vector<double> values(const Ref<Object>& chart, std::int64_t axis) {
  std::vector<double> result;
  const Ref<Array> answered = messages::_accessibilityDataSeriesValuesForAxis(chart, axis);
  for (const Ref<Object>& value : *answered) {
    result.push_back(cast<Number>(value)->doubleValue());
  }
  return result;
}

double least(const Ref<Object>& chart) {
  return messages::_accessibilityDataSeriesMinimumValueForAxis(chart, 1)->doubleValue();
}
double most(const Ref<Object>& chart) {
  return messages::_accessibilityDataSeriesMaximumValueForAxis(chart, 1)->doubleValue();
}

class TrendChartTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  static Ref<host::TrendDetailChartView> trend(std::size_t bars, const Answer& figure) {
    auto chart = make<host::TrendDetailChartView>();
    chart->setFrame({0, 0, static_cast<double>(bars) * 10, 100});
    chart->setAccessibilityUnit(Unit::kilocalorieUnit());
    chart->setBarStops(stops(bars));
    answer(*chart, "accessibilityQuantityForIndex:", figure);
    answer(*chart, "accessibilityDateIntervalForIndex:", [](std::size_t i) -> Ref<Object> {
      return make<DateInterval>(date(static_cast<double>(i) * day), date(static_cast<double>(i + 1) * day));
    });
    messages::layoutSubviews(chart);
    return chart;
  }

  static Ref<host::TrendDetailDailyAverageView> averages(const Answer& year, const Answer& quarter) {
    auto chart = make<host::TrendDetailDailyAverageView>();
    chart->setFrame({0, 0, 70, 100});
    chart->setAccessibilityUnit(Unit::kilocalorieUnit());
    chart->setDayStops(stops(7));
    answer(*chart, "accessibiliytQuantity365ForIndex:", year);
    answer(*chart, "accessibiliytQuantity90ForIndex:", quarter);
    messages::layoutSubviews(chart);
    return chart;
  }

  const EnvironmentScope environment_{Environment{.locale = "en_US", .timeZone = "UTC"}};
};

TEST_F(TrendChartTest, KeepsItsRangeFromFiguresThatAreNone) {
  const std::vector<double> figures = {nan, 12.345, nan, 30.999};
  const auto chart = trend(4, [&](std::size_t i) { return kilocalories(figures[i]); });
  EXPECT_EQ(messages::accessibilityElements(chart)->count(), 4u);
  EXPECT_EQ(least(chart), 0);
  EXPECT_EQ(most(chart), 31);
  EXPECT_TRUE(std::isnan(values(chart, 1)[0]));

  const auto endless = trend(2, [](std::size_t i) { return kilocalories(i == 0 ? -infinity : infinity); });
  messages::accessibilityElements(endless);
  EXPECT_EQ(least(endless), -infinity);
  EXPECT_EQ(most(endless), infinity);
}

TEST_F(TrendChartTest, KeepsAnEmptyRangeWhenNoBarHasAFigure) {
  const auto chart = trend(3, [](std::size_t) { return nullptr; });
  EXPECT_EQ(messages::accessibilityElements(chart)->count(), 0u);
  EXPECT_EQ(least(chart), 0);
  EXPECT_EQ(most(chart), 0);
  const Ref<Object> kept = chart->_accessibilityValueForKey(Selector::intern("kAXTrendDetailGraphCachedMin"));
  EXPECT_EQ(cast<Number>(kept)->doubleValue(), infinity);
}

TEST_F(TrendChartTest, TakesTenThousandBars) {
  std::size_t asked = 0;
  const auto chart = trend(10000, [&](std::size_t i) {
    ++asked;
    return kilocalories(static_cast<double>(i));
  });
  const Ref<Array> elements = messages::accessibilityElements(chart);
  ASSERT_EQ(elements->count(), 10000u);
  EXPECT_EQ(messages::accessibilityElements(chart), elements);
  EXPECT_EQ(asked, 10000u);
  EXPECT_EQ(messages::accessibilityFrame(elements->at(9999)), (Rect{100000, 0, 10, 100}));
  EXPECT_EQ(messages::accessibilityValue(elements->at(9999))->text(), "9,999 kilocalories");
  EXPECT_EQ(values(chart, 1)[9999], 9999);
}

TEST_F(TrendChartTest, CountsInIntegersAndMeasuresInDoubles) {
  const auto chart = trend(2, [](std::size_t) { return kilocalories(7); });
  const auto valueOf = [&chart](std::int64_t axis) {
    return cast<Number>(messages::_accessibilityDataSeriesValuesForAxis(chart, axis)->at(1));
  };
  EXPECT_EQ(messages::_accessibilityDataSeriesMaximumValueForAxis(chart, 0)->content(),
            Number::Content(std::uint64_t(2)));
  EXPECT_EQ(valueOf(0)->content(), Number::Content(std::int32_t(1)));
  EXPECT_EQ(valueOf(1)->content(), Number::Content(7.0));
}

TEST_F(TrendChartTest, RoundsEachAverageHalfUpAndKeepsTheRangeOfThose) {
  const auto chart = averages([](std::size_t) { return kilocalories(0.125); },
                              [](std::size_t) { return kilocalories(-0.125); });
  EXPECT_EQ(values(chart, 1)[0], 0.13);
  EXPECT_EQ(values(chart, 1)[1], -0.12);
  messages::accessibilityElements(chart);
  EXPECT_EQ(least(chart), -0.12);
  EXPECT_EQ(most(chart), 0.13);
}

TEST_F(TrendChartTest, WidensTheDailyRangeByFiguresAlone) {
  const auto chart = averages([](std::size_t i) { return kilocalories(i == 3 ? 10 : nan); },
                              [](std::size_t i) { return kilocalories(i == 5 ? -20 : nan); });
  messages::accessibilityElements(chart);
  EXPECT_EQ(least(chart), -20);
  EXPECT_EQ(most(chart), 10);
}

TEST_F(TrendChartTest, AsksForTheShorterAverageFirst) {
  std::string order;
  const auto noting = [&order](char mark) {
    return [&order, mark](std::size_t) {
      order += mark;
      return Ref<Object>();
    };
  };
  const auto chart = averages(noting('y'), noting('q'));
  messages::accessibilityElements(chart);
  EXPECT_EQ(order, "qyqyqyqyqyqyqy");
}

}  // namespace

}  // namespace ax
