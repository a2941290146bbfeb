#include "apps/axvelto/Command.h"

namespace ax::app {

void declareFile(CLI::App& app, Arguments& arguments) {
  app.add_option("FILE", arguments.files,
                 "a scene, or a workout file in FIT, TCX or GPX, also packed; - is standard input")
      ->required()
      ->expected(1);
}

void declareLocale(CLI::App& app, Arguments& arguments) {
  app.add_option("--locale", arguments.locale, "speak for this region, such as de_DE");
}

void declareWorkouts(CLI::App& app, Arguments& arguments) {
  app.add_option("--time-zone", arguments.timeZone,
                 "tell times by the clocks of this zone, such as Europe/Berlin");
  app.add_flag("--partial", arguments.readsDamaged, "read a damaged workout file as far as it goes");
  app.add_option("--workout", arguments.workout, "which one of several, from 1 on in the order of the files")
      ->check(CLI::PositiveNumber);
}

void declareWithout(CLI::App& app, Arguments& arguments) {
  app.add_option("--without", arguments.without, "a class, or Class.member, that the host does without")
      ->expected(1)
      ->take_all();
}

void declareChart(CLI::App& app, Arguments& arguments) {
  app.add_option("--of", arguments.chart, "only the charts in the object with this id");
}

void declareJson(CLI::App& app, Arguments& arguments) {
  app.add_flag("--json", arguments.asJson, "print JSON");
}

}  // namespace ax::app
