#include "apps/axvelto/Command.h"
#include "apps/axvelto/Output.h"
#include "apps/shared/Presentation.h"
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
  Presentation presentation(arguments);
  print(nlohmann::ordered_json{{"title", presentation.run().title()},
                               {"elements", reader::treeAsJson(presentation.snapshot())}});
  return exitDone;
}

}  // namespace

const Command treeCommand = {"tree", "The elements as JSON: label, value, hint, traits, frame, children",
                             declare, run};

}  // namespace ax::app
