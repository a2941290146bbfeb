#include "apps/axvelto/Command.h"

namespace ax::app {

void declareFile(CLI::App& app, Arguments& arguments) {
  app.add_option("FILE", arguments.files, "a scene or a workout file; - is standard input")
      ->required()
      ->expected(1);
}

void declareLocale(CLI::App& app, Arguments& arguments) {
  app.add_option("--locale", arguments.locale, "speak for this region, such as de_DE");
}

void declareWithout(CLI::App& app, Arguments& arguments) {
  app.add_option("--without", arguments.without, "a class, or Class.member, that the host does without")
      ->expected(1)
      ->take_all();
}

void declareJson(CLI::App& app, Arguments& arguments) {
  app.add_flag("--json", arguments.asJson, "print JSON");
}

}  // namespace ax::app
