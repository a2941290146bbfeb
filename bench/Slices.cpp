#include <cmath>
#include <limits>

#include "bench/BundleSides.h"
#include "bench/HostObjects.h"
#include "bench/Sides.h"
#include "platform/foundation/Array.h"
#include "platform/health/Workout.h"
#include "platform/toolkit/DataSeriesMessages.h"

// The heart rate of a workout, summed up in eight slices, beside a plain loop over the same readings.
namespace bench {

namespace {

using namespace ax;

constexpr int sliceCount = 8;

Ref<Array> readingsOf(int count) {
  const Ref<Unit> unit = Unit::unitFromString("count/min");
  Array::Items readings;
  for (int i = 0; i < count; ++i) {
    readings.push_back(
        make<HeartRateSummaryReading>(date(benchNow + i), quantity(90 + 80 * std::sin(0.01 * i), unit)));
  }
  return array(std::move(readings));
}

Ref<Object> heartRateChart(int count) {
  const Ref<Object> chart = hostObject("CHWorkoutDetailHeartRateChartView");
  const auto workout = make<Workout>();
  setMember(*workout, "startDate"_key, date(benchNow));
  setMember(*workout, "endDate"_key, date(benchNow + count));
  setMember(*chart, "_workout"_key, workout);
  setMember(*chart, "_heartRateReadings"_key, readingsOf(count));
  return chart;
}

void summarize(const Ref<Object>& chart) {
  for (std::uint64_t slice = 0; slice < sliceCount; ++slice) {
    const Ref<String> text = messages::_accessibilityQuantityForSliceAtIndex(chart, slice);
    check(text != nullptr, "a slice says nothing");
  }
}

// One pass per slice, as a chart that is asked slice by slice makes it.
double summarizePlainly(const Array& readings, double length) {
  double sum = 0;
  for (int slice = 0; slice < sliceCount; ++slice) {
    const double start = benchNow + slice * length;
    double lowest = std::numeric_limits<double>::max();
    double highest = std::numeric_limits<double>::min();
    for (const Ref<Object>& item : readings) {
      const auto& reading = static_cast<const HeartRateSummaryReading&>(*item);
      const double time = reading.date()->timeIntervalSince1970();
      if (time < start || time > start + length) continue;
      const double rate = std::round(reading.quantity()->value());
      lowest = std::min(lowest, rate);
      highest = std::max(highest, rate);
    }
    sum += lowest + highest;
  }
  return sum;
}

}  // namespace

void addSliceSides() {
  for (int count : readingSizes) {
    const std::string name = sized("slices ", count);
    RegisteredSide(
        name, "ours", [=] { return [chart = heartRateChart(count)] { summarize(chart); }; }, count);
    RegisteredSide(
        name, "floor",
        [=] {
          return [readings = readingsOf(count), length = double(count) / sliceCount] {
            benchmark::DoNotOptimize(summarizePlainly(*readings, length));
          };
        },
        count);
  }
}

}  // namespace bench
