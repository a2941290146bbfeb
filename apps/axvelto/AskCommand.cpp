#include "apps/axvelto/Command.h"
#include "apps/axvelto/Expectations.h"
#include "apps/axvelto/NodeActions.h"
#include "apps/axvelto/Output.h"
#include "apps/shared/ShownScene.h"

namespace ax::app {

namespace {

void declare(CLI::App& app, Arguments& arguments) {
  declareFile(app, arguments);
  declareLocale(app, arguments);
  declareWorkouts(app, arguments);
  declareWithout(app, arguments);
  app.add_flag("--accept", arguments.accepts, "write the replies into the scene as what it expects");
  CLI::Option_group* actions = app.add_option_group("Instead of the steps");
  actions->add_option("--activate", arguments.activate, "activate the element with this label or id");
  actions->add_option("--increment", arguments.increment, "increment it");
  actions->add_option("--decrement", arguments.decrement, "decrement it");
  actions->add_option("--at", arguments.point, "speak the element under this point, X,Y")
      ->delimiter(',')
      ->expected(2);
  actions->require_option(0, 1);
}

ExitCode run(const Arguments& arguments) {
  ShownScene shown(arguments);
  if (isNodeAction(arguments)) return runNodeAction(shown, arguments);
  const Outcome outcome = runScene(shown);
  if (arguments.accepts) return accept(shown.scene(), outcome);
  print(outcome.document);
  return holds(shown.scene(), outcome) ? exitDone : exitFallsShort;
}

}  // namespace

const Command askCommand = {
    "ask", "Run the scene's steps and print the replies as JSON, or act on an element", declare, run};

}  // namespace ax::app
