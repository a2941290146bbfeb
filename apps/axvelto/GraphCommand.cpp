#include <deque>
#include <iostream>
#include <unordered_set>

#include "apps/axvelto/Output.h"
#include "apps/axvelto/Presentation.h"
#include "reader/ReaderStrings.h"
#include "reader/graph/ChartDescription.h"

namespace ax::app {

namespace {

using reader::Node;
using reader::Snapshot;

void declare(CLI::App& app, Arguments& arguments) {
  declareFile(app, arguments);
  app.add_option("--of", arguments.chart, "only the charts in the object with this id");
  declareJson(app, arguments);
  declareLocale(app, arguments);
  declareWithout(app, arguments);
}

// Charts with the snapshots that they stand in.
struct Charts {
  std::deque<Snapshot> snapshots;
  std::vector<std::pair<const Snapshot*, const Node*>> found;
  std::unordered_set<const Object*> known;

  void add(Snapshot snapshot) {
    const Snapshot& kept = snapshots.emplace_back(std::move(snapshot));
    for (const Node* chart : reader::charts(kept)) {
      if (known.insert(kept.object(chart->id).get()).second) found.emplace_back(&kept, chart);
    }
  }
};

// All of the scene: on the screen, and in what is made beside it.
Charts allCharts(Presentation& presentation) {
  Charts charts;
  if (presentation.run().screen()) charts.add(presentation.snapshot());
  for (const Ref<Object>& object : presentation.run().objects()) charts.add(presentation.snapshotOf(object));
  return charts;
}

Charts chartsOf(Presentation& presentation, const std::string& id) {
  const Ref<Object> object = presentation.run().objectWithId(id);
  if (!object) {
    throw reader::Fault{presentation.scene().file, "--of", "no object \"" + id + "\"", "an id of the scene"};
  }
  Charts charts;
  charts.add(presentation.snapshotOf(object));
  return charts;
}

void printText(const Charts& charts) {
  if (charts.found.empty()) std::cout << reader::readerText("chart.none") << '\n';
  for (const auto& [snapshot, chart] : charts.found) {
    if (chart != charts.found.front().second) std::cout << '\n';
    print(reader::describeChart(*snapshot, *chart));
  }
}

void printJson(const Charts& charts) {
  nlohmann::ordered_json json = {{"charts", nlohmann::ordered_json::array()}};
  for (const auto& [snapshot, chart] : charts.found) {
    json["charts"].push_back(reader::chartAsJson(*snapshot, *chart));
  }
  print(json);
}

ExitCode run(const Arguments& arguments) {
  Presentation presentation(arguments);
  const bool isAll = arguments.chart.empty();
  const Charts charts = isAll ? allCharts(presentation) : chartsOf(presentation, arguments.chart);
  (arguments.asJson ? printJson : printText)(charts);
  return charts.found.empty() && !isAll ? exitFallsShort : exitDone;
}

}  // namespace

const Command graphCommand = {"graph", "Each chart as a data series: axes, units, ranges, values, slices",
                              declare, run};

}  // namespace ax::app
