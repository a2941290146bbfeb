#include "apps/axvelto/Input.h"
#include "apps/axvelto/Output.h"

namespace ax::app {

namespace {

void declare(CLI::App& app, Arguments& arguments) {
  app.add_option("FILE", arguments.files, "workout files (.tcx, .gpx); - is standard input")->required();
  declareLocale(app, arguments);
  app.add_option("--time-zone", arguments.timeZone, "where the workouts took place, such as Europe/Berlin");
}

ExitCode run(const Arguments& arguments) {
  checkLocale(arguments.locale);
  checkTimeZone(arguments.timeZone);
  std::vector<InputFile> files;
  for (const std::string& name : arguments.files) files.push_back({name, readInput(name)});
  print(importWorkouts(files, arguments));
  return exitDone;
}

}  // namespace

const Command importCommand = {"import", "A workout file, or several as a list, as a scene", declare, run};

}  // namespace ax::app
