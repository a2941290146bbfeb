#include <gtest/gtest.h>

#include "host/charts/ActivityActiveHoursChart.h"
#include "host/charts/ActivityQuantityChart.h"
#include "host/charts/VLUIChartPointNumeric.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/toolkit/DataSeriesMessages.h"
#include "tests/bundle/Members.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

// The slices of the day's charts where a scene cannot reach: charts that are cut otherwise, and precision.
namespace ax {

namespace {

// A chart of active hours that says itself how it is cut.
class OtherwiseCutChart : public host::ActivityActiveHoursChart {
 public:
  static Class& staticClass() {
    using T = OtherwiseCutChart;
    static Class& result = ClassBuilder<T>("OtherwiseCutChart", host::ActivityActiveHoursChart::staticClass())
                               .method<&T::numberOfSlices>("_accessibilityNumberOfSlices")
                               .build();
    return result;
  }
  std::uint64_t slices = 0;
  int timesAsked = 0;

 private:
  std::uint64_t numberOfSlices() {
    ++timesAsked;
    return slices;
  }
};

Ref<Object> chartPoint(Ref<Object> x, double y) {
  const auto made = make<host::VLUIChartPointNumeric>();
  made->setXValue(std::move(x));
  made->setYValue(number(y));
  return made;
}

std::string slice(Receiver chart, std::uint64_t index) {
  return messages::_accessibilityQuantityForSliceAtIndex(chart, index)->text();
}

constexpr double noon = 1780315200;  // of a day in UTC

class SliceTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  void show(Object& chart, Array::Items points) {
    const auto series = make<host::VLUIChartUniformBarSeries>();
    setMember(*series, "_minDate", date(noon - 5000));
    setMember(chart, "_barSeries", series);
    setMember(chart, "_dataPoints", array(std::move(points)));
  }

  const EnvironmentScope environment_{Environment{.locale = "en_US", .timeZone = "UTC", .now = noon}};
};

TEST_F(SliceTest, FollowsAChartThatIsCutOtherwise) {
  const auto chart = make<OtherwiseCutChart>();
  show(*chart, {chartPoint(date(noon - 1), 1), chartPoint(date(noon), 2), chartPoint(date(noon + 14399), 3)});
  chart->slices = 6;
  EXPECT_EQ(messages::_accessibilityHoursPerSlice(chart), 4u);
  EXPECT_EQ(messages::_accessibilityTimeIntervalPerSlice(chart), 14400);
  chart->timesAsked = 0;
  EXPECT_EQ(slice(chart, 2), "1 hour");
  EXPECT_EQ(slice(chart, 3), "5 hours");
  EXPECT_EQ(chart->timesAsked, 4);
  chart->slices = 7;
  EXPECT_EQ(messages::_accessibilityHoursPerSlice(chart), 3u);
}

TEST_F(SliceTest, HasNothingToTellOfAChartCutIntoNone) {
  for (const std::uint64_t slices : {std::uint64_t(0), std::uint64_t(25)}) {
    const auto chart = make<OtherwiseCutChart>();
    show(*chart, {chartPoint(date(noon - 43200), 1)});
    chart->slices = slices;
    EXPECT_EQ(messages::_accessibilityHoursPerSlice(chart), 0u);
    EXPECT_EQ(messages::_accessibilityTimeIntervalPerSlice(chart), 0);
    EXPECT_EQ(slice(chart, 0), "0 minutes");
  }
}

TEST_F(SliceTest, SumsInDoublePrecisionAndCountsHoursInSingle) {
  const auto hours = make<host::ActivityActiveHoursChart>();
  show(*hours, {chartPoint(date(noon), 16777216), chartPoint(date(noon), 1), chartPoint(date(noon), 2)});
  EXPECT_EQ(slice(hours, 4), "16,777,220 hours");

  const auto energy = make<host::ActivityQuantityChart>();
  Array::Items points;
  for (int i = 0; i < 24; ++i) points.push_back(chartPoint(nullptr, i == 0 ? 16777216 : 0.5));
  setMember(*energy, "_dataPoints", array(std::move(points)));
  EXPECT_EQ(slice(energy, 0), "16,777,217 calories");
  EXPECT_EQ(slice(energy, 1), "2 calories");
}

TEST_F(SliceTest, FindsNothingInSlicesFarBehindTheDay) {
  const auto hours = make<host::ActivityActiveHoursChart>();
  show(*hours, {chartPoint(date(noon), 1), chartPoint(date(noon - 43200 + 2 * 3600), 1)});
  // Three times this index is 2 when it is counted in 64 bits.
  EXPECT_EQ(slice(hours, 6148914691236517206u), "0 minutes");
  EXPECT_EQ(slice(hours, 18446744073709551615u), "0 minutes");
}

}  // namespace

}  // namespace ax
