#include "apps/axvelto/Command.h"
#include "apps/axvelto/Output.h"
#include "apps/shared/ShownScene.h"
#include "reader/transcript/TreeJson.h"

namespace ax::app {

namespace {

void declare(CLI::App& app, Arguments& arguments) {
  declareFile(app, arguments);
  declareLocale(app, arguments);
  declareWorkouts(app, arguments);
  declareWithout(app, arguments);
}

ExitCode run(const Arguments& arguments) {
  ShownScene shown(arguments);
  print(nlohmann::ordered_json{{"title", shown.run().title()},
                               {"elements", reader::treeAsJson(shown.snapshot())}});
  return exitDone;
}

}  // namespace

const Command treeCommand = {"tree", "The elements as JSON: label, value, hint, traits, frame, children",
                             declare, run};

}  // namespace ax::app
