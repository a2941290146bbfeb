#include "bench/BundleSides.h"
#include "bench/ChartFloors.h"
#include "bench/HostObjects.h"
#include "bench/Sides.h"
#include "host/charts/ActivityMoveAndExerciseChartView.h"
#include "host/charts/ActivityStandChartView.h"
#include "host/charts/TrendDetailChartView.h"
#include "platform/formatting/Region.h"
#include "platform/runtime/Value.h"
#include "platform/toolkit/DataSeriesMessages.h"

// A chart told that its points have changed, then asked for its elements.
namespace bench {

namespace {

using namespace ax;

Ref<View> laidOut(const Ref<View>& chart) {
  chart->setFrame({0, 0, 360, 200});
  chart->layoutSubviews();
  return chart;
}

Ref<View> moveChart(int spans) {
  const auto chart = make<host::ActivityMoveAndExerciseChartView>();
  Array::Items points;
  for (int i = 0; i < 3 * spans; ++i) points.push_back(point(double(i), moveOfSpan(i / 3) / 3));
  chart->setMoveAndExerciseChartPoints(array(std::move(points)));
  return chart;
}

Ref<View> standChart(int hours) {
  const auto chart = make<host::ActivityStandChartView>();
  Array::Items points;
  for (int i = 0; i < hours; ++i) points.push_back(point(double(i), double(i % 2)));
  chart->setStandChartPoints(array(std::move(points)));
  return chart;
}

struct Chart {
  const char* name;
  Ref<View> (*make)(int count);
};

std::size_t describe(const Ref<View>& chart) {
  messages::_accessibilityLoadAccessibilityInformation(chart);
  return messages::accessibilityElements(chart)->count();
}

void becomeCold() {
  formatting::setCurrentRegion(formatting::currentRegion());
}

// Ours, then the floor; the formatters of the cold ones are made anew for every build.
template <class Floor>
void addSides(const Chart& chart, int count) {
  const std::string name = sized(chart.name, count);
  const auto shown = [make = chart.make, count] {
    Ref<View> view = laidOut(make(count));
    check(describe(view) == static_cast<std::size_t>(count), "a chart lacks elements");
    return view;
  };
  RegisteredSide(
      name, "ours", [=] { return [view = shown()] { benchmark::DoNotOptimize(describe(view)); }; }, count);
  RegisteredSide(
      name, "floor", [=] { return [texts = std::make_shared<Floor>(), count] { texts->write(count); }; },
      count);
  RegisteredSide(
      name + " cold", "ours",
      [=] {
        return [view = shown()] {
          becomeCold();
          benchmark::DoNotOptimize(describe(view));
        };
      },
      count);
  RegisteredSide(
      name + " cold", "floor", [=] { return [count] { Floor().write(count); }; }, count);
}

}  // namespace

Ref<View> trendChart(int bars) {
  const auto chart = make<host::TrendDetailChartView>();
  const Ref<Unit> unit = Unit::unitFromString("km");
  Array::Items items;
  for (int i = 0; i < bars; ++i) {
    const double start = startOfBar(i, bars);
    items.push_back(hostObject("Velto.TrendBar"));
    setMember(*items.back(), "dateInterval"_key, make<DateInterval>(date(start), date(start + benchDay)));
    setMember(*items.back(), "quantity"_key, quantity(figureOfBar(i), unit));
  }
  setMember(*chart, "bars"_key, array(std::move(items)));
  chart->setAccessibilityUnit(unit);
  return laidOut(chart);
}

void addChartSides() {
  addSides<MoveChartTexts>({"move chart ", &moveChart}, 8);
  for (int hours : standSizes) addSides<StandChartTexts>({"stand chart ", &standChart}, hours);
  for (int bars : trendSizes) addSides<TrendChartTexts>({"trend ", &trendChart}, bars);
}

}  // namespace bench
