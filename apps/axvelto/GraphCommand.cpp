#include <iostream>

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

// An object need not be on the screen to be described.
Snapshot snapshotFor(Presentation& presentation, const std::string& id) {
  if (id.empty()) return presentation.snapshot();
  const Ref<Object> object = presentation.run().objectWithId(id);
  if (!object) {
    throw reader::Fault{presentation.scene().file, "--of", "no object \"" + id + "\"", "an id of the scene"};
  }
  return presentation.snapshotOf(object);
}

void printText(const Snapshot& snapshot, const std::vector<const Node*>& charts) {
  if (charts.empty()) std::cout << reader::readerText("chart.none") << '\n';
  for (const Node* chart : charts) {
    if (chart != charts.front()) std::cout << '\n';
    print(reader::describeChart(snapshot, *chart));
  }
}

void printJson(const Snapshot& snapshot, const std::vector<const Node*>& charts) {
  nlohmann::ordered_json json = {{"charts", nlohmann::ordered_json::array()}};
  for (const Node* chart : charts) json["charts"].push_back(reader::chartAsJson(snapshot, *chart));
  print(json);
}

ExitCode run(const Arguments& arguments) {
  Presentation presentation(arguments);
  const Snapshot snapshot = snapshotFor(presentation, arguments.chart);
  const std::vector<const Node*> charts = reader::charts(snapshot);
  (arguments.asJson ? printJson : printText)(snapshot, charts);
  return charts.empty() ? exitFallsShort : exitDone;
}

}  // namespace

const Command graphCommand = {"graph", "Each chart as a data series: axes, units, ranges, values, slices",
                              declare, run};

}  // namespace ax::app
