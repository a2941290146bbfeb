#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <stdexcept>

#include "platform/foundation/Date.h"
#include "platform/foundation/Environment.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/toolkit/DataSeriesMessages.h"
#include "platform/toolkit/TableViewCell.h"
#include "reader/graph/ChartDescription.h"
#include "reader/snapshot/Charts.h"
#include "tests/reader/ScreenPieces.h"

namespace ax::reader::testing {

namespace {

using Lines = std::vector<std::string>;

// A chart of two points that describes places on its first axis only; its second axis has no upper end.
class Series : public View {
 public:
  using T = Series;
  static Class& staticClass() {
    static Class& result =
        ClassBuilder<T>("GraphTestSeries", View::staticClass())
            .method<&T::containerType>("accessibilityContainerType")
            .method<&T::sonification>("_accessibilityDataSeriesSupportsSonification")
            .method<&T::type>("_accessibilityDataSeriesType")
            .method<&T::name>("_accessibilityDataSeriesName")
            .method<&T::values>("_accessibilityDataSeriesValuesForAxis:")
            .method<&T::title>("_accessibilityDataSeriesTitleForAxis:")
            .method<&T::minimum>("_accessibilityDataSeriesMinimumValueForAxis:")
            .method<&T::maximum>("_accessibilityDataSeriesMaximumValueForAxis:")
            .method<&T::position>("_accessibilityDataSeriesValueDescriptionForPosition:axis:")
            .build();
    return result;
  }
  std::int64_t containerType() { return messages::dataSeriesContainerType; }
  bool sonification() { return true; }
  std::int64_t type() { return 2; }
  Ref<String> name() { return string("Moves"); }
  Ref<Array> values(std::int64_t axis) {
    if (axis == horizontalAxis) return array({number(0.5), number(12)});
    return array({number(3), string("not a number"), number(4.25)});
  }
  Ref<String> title(std::int64_t axis) { return axis == horizontalAxis ? string("Time") : nullptr; }
  Ref<Number> minimum(std::int64_t) { return number(0); }
  Ref<Number> maximum(std::int64_t axis) { return axis == horizontalAxis ? number(24) : nullptr; }
  Ref<String> position(double position, std::int64_t axis) {
    if (position > 0.9) throw std::runtime_error("outside");
    return axis == horizontalAxis ? string(std::to_string(int(position * 24)) + " o'clock") : nullptr;
  }
};

// A row of slices; the counts are set by the tests.
class Slices : public View {
 public:
  using T = Slices;
  static Class& staticClass() {
    static Class& result = ClassBuilder<T>("GraphTestSlices", View::staticClass())
                               .method<&T::usesSlices>("_accessibilityShouldUseSlices")
                               .method<&T::numberOfSlices>("_accessibilityNumberOfSlices")
                               .method<&T::seconds>("_accessibilityTimeIntervalPerSlice")
                               .method<&T::hours>("_accessibilityHoursPerSlice")
                               .method<&T::quantity>("_accessibilityQuantityForSliceAtIndex:")
                               .build();
    return result;
  }
  bool usesSlices() { return answers; }
  std::uint64_t numberOfSlices() { return count; }
  double seconds() { return secondsPerSlice; }
  std::uint64_t hours() { return hoursPerSlice; }
  Ref<String> quantity(std::uint64_t index) {
    return index == 1 ? nullptr : string(std::to_string(index * 10) + " calories");
  }

  bool answers = true;
  std::uint64_t count = 2;
  double secondsPerSlice = 450;
  std::uint64_t hoursPerSlice = 0;
};

TEST(GraphTest, ReadsASeriesWithBothAxes) {
  const Snapshot snapshot = takeSnapshot(view({view<Series>({})}));
  ASSERT_EQ(charts(snapshot).size(), 1u);
  const Node& chart = *charts(snapshot)[0];
  EXPECT_EQ(chart.role, Role::chart);
  EXPECT_FALSE(chart.isElement);
  EXPECT_EQ(chart.series->axes[horizontalAxis].values, (std::vector<double>{0.5, 12}));
  EXPECT_EQ(chart.series->axes[verticalAxis].values, (std::vector<double>{3, 4.25}));  // numbers alone
  EXPECT_EQ(chart.series->axes[verticalAxis].maximum, std::nullopt);
  EXPECT_EQ(chart.series->axes[horizontalAxis].positions.size(), 4u);  // the fifth one raises
  EXPECT_TRUE(chart.series->axes[verticalAxis].positions.empty());
  EXPECT_EQ(snapshot.timesRaised(), 2u);
}

TEST(GraphTest, DescribesASeriesWithItsElements) {
  const Ref<View> chart = view<Series>({}, {10, 20, 200, 100});
  const Ref<AccessibilityElement> bar = element("Noon", chart);
  messages::setAccessibilityValue(bar, string("3 calories"));
  bar->setAccessibilityFrameInContainerSpace({5, 6, 7, 8});
  messages::setAccessibilityElements(chart, array({bar}));
  const Snapshot snapshot = takeSnapshot(chart);
  EXPECT_EQ(describeChart(snapshot, *charts(snapshot).at(0)),
            (Lines{"Chart: Moves", "  Kind of series: 2, Can be played as sound",
                   "  Horizontal axis: Time, from 0 to 24, 2 values", "    0.5; 12", "    At 0%: 0 o'clock",
                   "    At 25%: 6 o'clock", "    At 50%: 12 o'clock", "    At 75%: 18 o'clock",
                   "  Vertical axis: Lowest: 0, 2 values", "    3; 4.25", "  1 element",
                   "    Noon, 3 calories, left 15, top 26, width 7, height 8"}));
}

TEST(GraphTest, NamesTheUnitOfAnAxis) {
  const Ref<View> screen = view<Series>({}, {10, 20, 200, 100});
  const Snapshot snapshot = takeSnapshot(screen);
  Node chart = *charts(snapshot).at(0);
  const std::pair<const char*, const char*> units[] = {
      {"ml/kg/min", "Unit: milliliters per kilogram per minute, "},
      {"steps", "Unit: steps, "},
      {"count", ""}};
  for (const auto& [label, told] : units) {
    chart.series->axes[verticalAxis].unitLabel = AttributedText{label};
    const std::vector<std::string> lines = describeChart(snapshot, chart);
    const std::string expected = std::string("  Vertical axis: ") + told + "Lowest: 0, 2 values";
    EXPECT_NE(std::ranges::find(lines, expected), lines.end()) << label;
  }
}

TEST(GraphTest, AsksConsecutiveSlices) {
  const Ref<Slices> chart = view<Slices>({});
  Snapshot snapshot = takeSnapshot(chart);
  const DataSeries& series = *charts(snapshot).at(0)->series;
  EXPECT_FALSE(series.hasAxes);
  ASSERT_EQ(series.slices.size(), 2u);
  EXPECT_EQ(series.slices[1].start, series.slices[0].end);
  EXPECT_EQ(series.slices[1].end, 900);
  EXPECT_EQ(describeChart(snapshot, *charts(snapshot).at(0)),
            (Lines{"Chart without a title", "  2 slices, 7 minutes, 30 seconds per slice",
                   "    Slice 1, from 0 minutes to 7 minutes, 30 seconds, 0 calories",
                   "    Slice 2, from 7 minutes, 30 seconds to 15 minutes, No data in the chart"}));

  chart->answers = false;
  EXPECT_TRUE(charts(takeSnapshot(chart)).empty());
}

// Slices of a certain time: two of an hour and a half from 23:15, over the night in which clocks go forward.
class TimedSlices : public Slices {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<TimedSlices>("GraphTestTimedSlices", Slices::staticClass())
                               .method<&TimedSlices::dateInterval>("dateInterval")
                               .build();
    return result;
  }
  Ref<DateInterval> dateInterval() { return make<DateInterval>(date(start), date(start + 10800)); }

  static constexpr double start = 1772943300;  // 2026-03-07T23:15 in New York
};

TEST(GraphTest, TellsTheTimeOfDayOfASliceWhereTheChartHasOne) {
  setEnvironment({.timeZone = "America/New_York"});
  const Ref<TimedSlices> chart = view<TimedSlices>({});
  chart->secondsPerSlice = 5400;
  const Snapshot snapshot = takeSnapshot(chart);
  const auto lines = describeChart(snapshot, *charts(snapshot).at(0));
  EXPECT_EQ(lines.at(2), "    Slice 1, from 11:15\u202fPM to 12:45\u202fAM, 0 calories");
  EXPECT_EQ(lines.at(3), "    Slice 2, from 12:45\u202fAM to 3:15\u202fAM, No data in the chart");
  EXPECT_EQ(chartAsJson(snapshot, *charts(snapshot)[0])["slices"][1]["to"], "2026-03-08T03:15:00-04:00");
  setEnvironment({});
}

TEST(GraphTest, NamesASliceChartByItsLabelItsCellOrItsKind) {
  const auto heading = [](const Ref<View>& screen) {
    const Snapshot snapshot = takeSnapshot(screen);
    return describeChart(snapshot, *charts(snapshot).at(0)).at(0);
  };
  const Ref<Slices> chart = view<Slices>({});
  const Ref<TableViewCell> cell = make<TableViewCell>();
  cell->setFrame({0, 0, 320, 200});
  cell->contentView()->addSubview(view({chart}));
  EXPECT_EQ(heading(cell), "Chart without a title");
  cell->contentView()->addSubview(label("Stairs"));
  EXPECT_EQ(heading(cell), "Chart: Stairs");
  cell->setTextLabel(label("Floors"));
  EXPECT_EQ(heading(cell), "Chart: Floors");
  messages::setAccessibilityLabel(chart, string("Flights"));
  EXPECT_EQ(heading(cell), "Chart: Flights");

  const Ref<Label> title = label("Stairs of the week");
  messages::setAccessibilityTraits(title, TraitHeader);
  const Ref<Slices> headed = view<Slices>({label("first"), title});
  EXPECT_EQ(heading(headed), "Chart: Stairs of the week");
}

TEST(GraphTest, TellsTheLengthOfASlice) {
  const Ref<Slices> chart = view<Slices>({});
  const auto length = [&chart] {
    const Snapshot snapshot = takeSnapshot(chart);
    return describeChart(snapshot, *charts(snapshot).at(0)).at(1);
  };
  chart->secondsPerSlice = 3 * 3600;
  EXPECT_EQ(length(), "  2 slices, 3 hours per slice");
  chart->secondsPerSlice = 5400;
  EXPECT_EQ(length(), "  2 slices, 1 hour, 30 minutes per slice");
}

TEST(GraphTest, BoundsWhatABrokenHostCounts) {
  const Ref<Slices> chart = view<Slices>({});
  chart->count = std::numeric_limits<std::uint64_t>::max();
  chart->hoursPerSlice = std::numeric_limits<std::uint64_t>::max();
  chart->secondsPerSlice = std::numeric_limits<double>::quiet_NaN();
  const Snapshot many = takeSnapshot(chart);
  EXPECT_LT(charts(many).at(0)->series->slices.size(), 100000u);
  EXPECT_FALSE(describeChart(many, *charts(many)[0]).empty());

  chart->count = 0;
  const Snapshot none = takeSnapshot(chart);
  EXPECT_EQ(describeChart(none, *charts(none).at(0)).back(), "  No data in the chart");
}

TEST(GraphTest, PrintsJson) {
  const Snapshot snapshot = takeSnapshot(view({view<Series>({}), view<Slices>({}, {0, 900, 10, 10})}));
  const auto found = charts(snapshot);
  ASSERT_EQ(found.size(), 2u);
  const auto series = chartAsJson(snapshot, *found[0]), slices = chartAsJson(snapshot, *found[1]);
  EXPECT_EQ(series["axes"][0]["maximum"], 24);
  EXPECT_TRUE(series["axes"][1]["title"].is_null());
  EXPECT_EQ(series["axes"][0]["positions"][1]["description"], "6 o'clock");
  EXPECT_FALSE(series.contains("slices"));
  EXPECT_EQ(slices["slices"][0]["quantity"], "0 calories");
  EXPECT_TRUE(slices["slices"][1]["quantity"].is_null());
  EXPECT_FALSE(slices.contains("axes"));
}

}  // namespace

}  // namespace ax::reader::testing
