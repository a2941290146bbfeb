#include <iostream>

#include "apps/axvelto/Command.h"
#include "apps/axvelto/Output.h"
#include "apps/axvelto/SceneCharts.h"
#include "reader/graph/ChartDescription.h"
#include "reader/snapshot/Charts.h"
#include "reader/text/ReaderStrings.h"

namespace ax::app {

namespace {

void declare(CLI::App& app, Arguments& arguments) {
  declareFile(app, arguments);
  declareChart(app, arguments);
  declareJson(app, arguments);
  declareLocale(app, arguments);
  declareWorkouts(app, arguments);
  declareWithout(app, arguments);
}

void printCharts(const SceneCharts::Found& charts) {
  if (charts.empty()) std::cout << reader::readerText("chart.none") << '\n';
  for (const auto& [snapshot, chart] : charts) {
    if (chart != charts.front().second) std::cout << '\n';
    print(reader::describeChart(*snapshot, *chart));
  }
}

void printJson(const SceneCharts::Found& charts) {
  nlohmann::ordered_json json = {{"charts", nlohmann::ordered_json::array()}};
  for (const auto& [snapshot, chart] : charts) {
    json["charts"].push_back(reader::chartAsJson(*snapshot, *chart));
  }
  print(json);
}

ExitCode run(const Arguments& arguments) {
  ShownScene shown(arguments);
  const SceneCharts charts(shown, arguments.chart);
  (arguments.asJson ? printJson : printCharts)(charts.found());
  return charts.found().empty() && !arguments.chart.empty() ? exitFallsShort : exitDone;
}

}  // namespace

const Command graphCommand = {"graph", "Each chart as a data series: axes, units, ranges, values, slices",
                              declare, run};

}  // namespace ax::app
