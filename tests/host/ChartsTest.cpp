#include <gtest/gtest.h>

#include <cmath>

#include "host/charts/CHWorkoutDetailHeartRateChartView.h"
#include "host/charts/HeartRateUnits.h"
#include "host/charts/TrendStops.h"
#include "host/core/Layout.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/workouts/SomeWorkout.h"

// How the app lays out its charts and rows, and what it draws of a heart rate.
namespace ax::host {

namespace {

constexpr double start = 1780000000;

Ref<Object> reading(double time, double rate) {
  return make<HeartRateSummaryReading>(date(time), quantity(rate, Unit::unitFromString("count/min")));
}

struct Column {
  double time;
  std::int64_t lowest, highest;
  bool operator==(const Column&) const = default;
};

class HeartRateChartTest : public testing::Test {
 protected:
  void SetUp() override {
    setMember(*workout_, "startDate", date(start));
    setMember(*workout_, "endDate", date(start + 3600));
    setMember(*chart_, "_workout", workout_);
  }

  // A minute per column.
  std::vector<Column> columnsOf(Array::Items readings) {
    setMember(*chart_, "_heartRateReadings", array(std::move(readings)));
    chart_->showReadings();
    std::vector<Column> columns;
    const Ref<Array> points = member<Array>(*chart_, "_heartRateChartPoints");
    for (std::size_t i = 0; points && i < points->count(); ++i) {
      Object& point = *points->at(i);
      Object& span = *point.safeValueForKey("yValue"_key);
      columns.push_back({member<Date>(point, "xValue")->timeIntervalSince1970() - start,
                         span.safeIntForKey("firstIndex"_key), span.safeIntForKey("lastIndex"_key)});
    }
    return columns;
  }

  const Ref<Workout> workout_ = make<Workout>();
  const Ref<CHWorkoutDetailHeartRateChartView> chart_ = make<CHWorkoutDetailHeartRateChartView>();
};

TEST_F(HeartRateChartTest, DrawsAColumnForEachMinuteThatHasReadings) {
  const std::vector<Column> expected = {{0, 98, 121}, {120, 140, 140}, {3540, 99, 150}};
  EXPECT_EQ(columnsOf({reading(start + 59.9, 98.4), reading(start, 120.6), reading(start + 30, 110),
                       reading(start + 120, 140), reading(start + 3600, 150),  // the end itself
                       reading(start + 9000, 99)}),
            expected);
  EXPECT_TRUE(chart_->hasAdequateDataForDisplay());
  const Ref<Object> inner = chart_->safeValueForKey("_chartView"_key);
  EXPECT_EQ(safeDoubleForKey(inner, "minYValue"_key), 98);
  EXPECT_EQ(safeDoubleForKey(inner, "maxYValue"_key), 150);
}

TEST_F(HeartRateChartTest, LeavesOutWhatIsNoHeartRate) {
  const std::vector<Column> expected = {{60, 100, 100}};
  EXPECT_EQ(columnsOf({reading(start + 60, 100), reading(start, std::nan("")), reading(start, -1),
                       reading(start, 1000), reading(start, HUGE_VAL), string("120"),
                       make<HeartRateSummaryReading>(), make<HeartRateSummaryReading>(date(start), nullptr)}),
            expected);
  EXPECT_FALSE(chart_->hasAdequateDataForDisplay()) << "one point is no line";
}

TEST_F(HeartRateChartTest, PutsFarReadingsAtTheEndThatTheyAreNearer) {
  const std::vector<Column> expected = {{0, 90, 90}, {3540, 120, 120}};
  EXPECT_EQ(columnsOf({reading(start - 1e15, 90), reading(start + 1e15, 120)}), expected);
}

TEST_F(HeartRateChartTest, HasNothingToDrawWithoutAStretchOfTime) {
  setMember(*workout_, "endDate", date(start));
  EXPECT_TRUE(columnsOf({reading(start, 100)}).empty());
  setMember(*workout_, "endDate", nullptr);
  EXPECT_TRUE(columnsOf({reading(start, 100)}).empty());
  chart_->layoutSubviews();
  EXPECT_TRUE(chart_->subviews().empty());
}

TEST(LayoutTest, PlacesWhatStandsNowhere) {
  const auto parent = make<View>();
  parent->setFrame({10, 10, 100, 90});
  const auto placed = make<View>();
  const auto free = make<View>();
  const auto elsewhere = make<View>();
  const auto other = make<View>();
  placed->setFrame({1, 2, 3, 4});
  elsewhere->setFrame({7, 7, 7, 7});
  other->addSubview(elsewhere);
  for (int i = 0; i < 2; ++i) {
    stackIn(*parent, {placed, nullptr, free});
    stackIn(*parent, {elsewhere});
    addUnplaced(*parent, elsewhere, {0, 0, 5, 5});
    EXPECT_EQ(parent->subviews(), (std::vector<Ref<View>>{placed, free}));
    EXPECT_EQ(placed->frame(), (Rect{1, 2, 3, 4}));
    EXPECT_EQ(free->frame(), (Rect{0, 60, 100, 30})) << "the missing one keeps its place";
    EXPECT_EQ(elsewhere->superview(), other.get());
    EXPECT_EQ(elsewhere->frame(), (Rect{7, 7, 7, 7}));
  }
  EXPECT_EQ(columnOf(*parent, 2, 4), (Rect{50, 0, 25, 90}));
}

TEST(LayoutTest, SharesAWidthEvenly) {
  EXPECT_TRUE(evenStops(0, 100)->isEmpty());
  const Ref<Array> stops = evenStops(8, 100);
  ASSERT_EQ(stops->count(), 8u);
  for (std::size_t i = 0; i < 8; ++i)
    EXPECT_DOUBLE_EQ(cast<Number>(stops->at(i))->doubleValue(), 12.5 * static_cast<double>(i));
  EXPECT_EQ(&itemAt<Number>(stops, 7), stops->at(7).get());
  for (const std::int32_t index : {-1, 8, std::numeric_limits<std::int32_t>::min()})
    EXPECT_THROW(itemAt<Number>(stops, index), std::out_of_range);
  EXPECT_THROW(itemAt<Date>(stops, 0), std::out_of_range) << "of another kind";
  EXPECT_THROW(itemAt<Number>(nullptr, 0), std::out_of_range);
}

}  // namespace

}  // namespace ax::host
