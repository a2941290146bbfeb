#include "bench/BundleSides.h"

#include <filesystem>
#include <iterator>

#include "bench/Comparison.h"
#include "platform/accessibility/BundleLoader.h"
#include "platform/foundation/Environment.h"

namespace bench {

namespace {

void compareChart(const std::string& name, const std::string& title, const std::vector<Bound>& bounds,
                  std::vector<Row>& rows) {
  compare({name, title + ", per element", bounds}, rows);
  compare({name + " cold", title + ", per element, cold"}, rows);
}

void compareCharts(std::vector<Row>& rows) {
  compareChart("move chart 8", "move chart of 8", {{"floor", 1.5}}, rows);
  for (int hours : standSizes)
    compareChart(sized("stand chart ", hours), sized("stand chart of ", hours), {}, rows);
  for (int bars : trendSizes) compareChart(sized("trend ", bars), sized("trend of ", bars), {}, rows);
  compareGrowth({"stand chart, growth per element from 24", sized("stand chart ", standSizes[0]),
                 sized("stand chart ", standSizes[1]), 1.25},
                rows);
  compareGrowth({"trend, growth per element from 365", sized("trend ", trendSizes[0]),
                 sized("trend ", trendSizes[1]), 1.25},
                rows);
}

void compareSlices(std::vector<Row>& rows) {
  for (int readings : readingSizes)
    compare({sized("slices ", readings), sized("8 slices, per reading of ", readings)}, rows);
  compareGrowth({"8 slices, growth per reading", sized("slices ", readingSizes[0]),
                 sized("slices ", readingSizes[1]), 1.25},
                rows);
}

void compareMonths(std::vector<Row>& rows) {
  for (int days : monthSizes) compare({sized("month ", days), sized("month, per day of ", days)}, rows);
  compareGrowth({"month, growth per day from 42 to 4200", sized("month ", monthSizes[0]),
                 sized("month ", monthSizes[2]), 1.25},
                rows);
  rows.push_back({"month of 42, formatters made when warm", "", formattersMadeByWarmMonth(), "bound", 0, 1});
}

void compareSounds(std::vector<Row>& rows) {
  const char* const titles[] = {"sound of a day, per value of 24", "sound of a month, per value of 30",
                                "sound of readings, per value of 10000"};
  for (std::size_t i = 0; i < std::size(soundSizes); ++i) {
    compare({sized("sound ", soundSizes[i]), titles[i]}, rows);
  }
  compareGrowth({"sound, growth per value from 24 to 10000", sized("sound ", soundSizes[0]),
                 sized("sound ", soundSizes[2]), 1.25},
                rows);
}

}  // namespace

bool openBundleForSides(const std::string& program) {
  const auto built = std::filesystem::canonical(program).parent_path().parent_path();
  ax::setEnvironment({.timeZone = "America/New_York", .now = benchNow});
  std::string error;
  const auto bundle = ax::LoadedBundle::open(built / "lib/AXVelto/AXVelto.so", "AXVeltoGlue", error);
  if (!bundle) return false;
  bundle->start();
  addChartSides();
  addSliceSides();
  addMonthSides();
  addSoundSides();
  return true;
}

void compareBundleSides(std::vector<Row>& rows) {
  compareCharts(rows);
  compareSlices(rows);
  compareMonths(rows);
  compareSounds(rows);
}

}  // namespace bench
