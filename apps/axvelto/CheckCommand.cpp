#include <iostream>

#include "apps/axvelto/Command.h"
#include "apps/axvelto/Output.h"
#include "apps/shared/Input.h"
#include "apps/shared/ShownScene.h"
#include "reader/contract/ContractReport.h"

namespace ax::app {

namespace {

void declare(CLI::App& app, Arguments& arguments) {
  app.add_option("FILE", arguments.files, "a scene whose host is checked; else the whole host as it is")
      ->expected(0, 1);
  declareWithout(app, arguments);
  declareJson(app, arguments);
}

reader::Scene sceneToCheck(const Arguments& arguments) {
  if (!arguments.files.empty()) return sceneFor(arguments);
  checkOmissions(arguments.without);
  return {.file = "host"};
}

ExitCode run(const Arguments& arguments) {
  reader::Scene scene = sceneToCheck(arguments);
  scene.environment.checks = true;
  const reader::SceneRun start(scene, {.modulePath = modulePath(), .without = arguments.without});
  const reader::ContractReport report = reader::ContractReport::ofProcess();
  if (arguments.asJson) {
    print(report.json());
  } else {
    printText(report.text());
  }
  return report.holds() ? exitDone : exitFallsShort;
}

}  // namespace

const Command checkCommand = {"check", "The host contract, check by check", declare, run};

}  // namespace ax::app
