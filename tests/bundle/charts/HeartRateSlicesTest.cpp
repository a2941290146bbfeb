#include <gtest/gtest.h>

#include <array>
#include <limits>

#include "host/charts/CHWorkoutDetailHeartRateChartView.h"
#include "platform/foundation/Formatters.h"
#include "platform/toolkit/DataSeriesMessages.h"
#include "tests/bundle/Members.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

// The summary of a workout's heart rate in slices, against readings counted by other means: whole seconds and
// tenths of a beat, in integers.
namespace ax {

namespace {

constexpr int sliceCount = 8;
constexpr double workoutStart = 1772953200;
constexpr double nan = std::numeric_limits<double>::quiet_NaN();

struct Reading {
  int second;  // since the start of the workout
  int tenths;  // of a beat per minute
};

Ref<Object> reading(double seconds, double rate) {
  static const Ref<Unit>& unit = *new Ref<Unit>(Unit::unitFromString("count/min"));
  return make<HeartRateSummaryReading>(date(workoutStart + seconds), quantity(rate, unit));
}

Ref<Object> chartOf(double duration, Array::Items readings) {
  const auto workout = make<Workout>();
  setMember(*workout, "startDate", date(workoutStart));
  setMember(*workout, "endDate", date(workoutStart + duration));
  const auto chart = make<host::CHWorkoutDetailHeartRateChartView>();
  setMember(*chart, "_workout", workout);
  setMember(*chart, "_heartRateReadings", array(std::move(readings)));
  return chart;
}

std::vector<std::string> slicesOf(const Ref<Object>& chart) {
  std::vector<std::string> slices;
  for (std::uint64_t i = 0; i < messages::_accessibilityNumberOfSlices(chart); ++i) {
    const Ref<String> text = messages::_accessibilityQuantityForSliceAtIndex(chart, i);
    slices.push_back(text ? text->text() : "(none)");
  }
  return slices;
}

// A pulse that climbs, drops out for a while and jumps about.
std::vector<Reading> recordedPulse(int duration) {
  std::vector<Reading> readings;
  unsigned noise = 12345;
  for (int second = -30; second <= duration + 30; second += 1 + static_cast<int>(noise % 3)) {
    noise = noise * 1664525u + 1013904223u;
    if (second > duration / 2 + 5 && second < duration * 5 / 8 - 5) continue;
    readings.push_back({second, 950 + second * 600 / duration + static_cast<int>(noise >> 16) % 97});
  }
  readings.push_back({duration / sliceCount * 3, 1995});  // on a bound: in both slices
  return readings;
}

// Every reading goes into the slice of its second, and also into the one before when it begins the slice.
std::vector<std::string> countedSlices(const std::vector<Reading>& readings, int duration) {
  const int length = duration / sliceCount;
  std::array<std::pair<int, int>, sliceCount> ranges;
  ranges.fill({std::numeric_limits<int>::max(), 0});
  const auto count = [&](int slice, int rate) {
    if (slice < 0 || slice >= sliceCount) return;
    auto& [lowest, highest] = ranges[static_cast<std::size_t>(slice)];
    lowest = std::min(lowest, rate);
    highest = std::max(highest, rate);
  };
  for (const auto& [second, tenths] : readings) {
    const int rate = (tenths + 5) / 10;
    if (second >= 0) count(second / length, rate);
    if (second > 0 && second % length == 0) count(second / length - 1, rate);
  }
  std::vector<std::string> texts;
  for (const auto& [lowest, highest] : ranges) {
    texts.push_back(highest == 0
                        ? "(none)"
                        : std::to_string(lowest) + " to " + std::to_string(highest) + " beats per minute");
  }
  return texts;
}

class HeartRateSlicesTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  const EnvironmentScope environment_{Environment{.locale = "en_US", .timeZone = "Europe/Madrid"}};
};

TEST_F(HeartRateSlicesTest, AgreeWithTheReadingsCountedOneByOne) {
  constexpr int duration = sliceCount * 405;
  const std::vector<Reading> readings = recordedPulse(duration);
  Array::Items items;
  for (const auto& [second, tenths] : readings) items.push_back(reading(second, tenths / 10.0));
  const std::vector<std::string> slices = slicesOf(chartOf(duration, items));
  EXPECT_EQ(slices, countedSlices(readings, duration));
  EXPECT_EQ(slices[2].substr(slices[2].find(" to ")), " to 200 beats per minute");
  EXPECT_EQ(slices[3].substr(slices[3].find(" to ")), " to 200 beats per minute");
}

// Sevenths of a second cannot be written exactly; a reading on a bound still counts on both sides.
TEST_F(HeartRateSlicesTest, ShareTheirBoundsExactly) {
  constexpr double duration = workoutStart + 3600 / 7.0 - workoutStart;  // as dates can hold it
  Array::Items items;
  for (int i = 1; i < sliceCount; ++i) {
    const double bound = duration / sliceCount * i;
    items.push_back(reading(bound, 60 + i));
  }
  const std::vector<std::string> expected = {"61 beats per minute",       "61 to 62 beats per minute",
                                             "62 to 63 beats per minute", "63 to 64 beats per minute",
                                             "64 to 65 beats per minute", "65 to 66 beats per minute",
                                             "66 to 67 beats per minute", "67 beats per minute"};
  EXPECT_EQ(slicesOf(chartOf(duration, items)), expected);
}

TEST_F(HeartRateSlicesTest, LeaveOutWhatIsNoHeartRate) {
  const double infinity = std::numeric_limits<double>::infinity();
  const auto noRate =
      make<HeartRateSummaryReading>(date(workoutStart + 10), quantity(150, Unit::unitFromString("kcal")));
  const Array::Items items = {reading(10, nan),
                              reading(20, -infinity),
                              noRate,
                              make<HeartRateSummaryReading>(),
                              string("150"),
                              reading(800, 71.5),
                              reading(801, nan),
                              reading(802, 71.5)};
  const std::vector<std::string> slices = slicesOf(chartOf(sliceCount * 100, items));
  EXPECT_EQ(slices[0], "(none)");
  EXPECT_EQ(slices[7], "72 beats per minute");
}

}  // namespace

}  // namespace ax
