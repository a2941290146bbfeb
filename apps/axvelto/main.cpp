#include <iostream>

#include "apps/axvelto/Command.h"
#include "reader/Fault.h"

namespace {

using namespace ax::app;

const Command* const commands[] = {&speakCommand, &treeCommand, &graphCommand,
                                   &checkCommand, &askCommand,  &importCommand};

std::string usageFailure(const CLI::App* app, const CLI::Error& error) {
  const std::vector<std::string> left = app->remaining();
  const bool isUnknownCommand = app->get_subcommands().empty() && !left.empty();
  const std::string what = isUnknownCommand ? "unknown command \"" + left.front() + "\"" : error.what();
  return "axvelto: " + what + " (axvelto --help tells the use)\n";
}

int runCommand(const Command& command, const Arguments& arguments) {
  try {
    const ExitCode code = command.run(arguments);
    if (std::cout.flush()) return code;
    std::cerr << "axvelto: standard output: cannot be written, expected room for the result\n";
  } catch (const ax::reader::Fault& fault) {
    std::cerr << fault.text() << '\n';
  } catch (const std::exception& error) {
    std::cerr << "axvelto: " << command.name << ": " << error.what() << '\n';
  }
  return exitBadUse;
}

}  // namespace

int main(int argc, char** argv) {
  CLI::App app("Speaks, describes and checks screens of the activity app.", "axvelto");
  app.set_version_flag("--version", "axvelto " AXVELTO_VERSION);
  app.require_subcommand(1);
  app.failure_message(usageFailure);
  Arguments arguments;
  for (const Command* command : commands) {
    command->declare(*app.add_subcommand(command->name, command->help), arguments);
  }
  try {
    app.parse(argc, argv);
  } catch (const CLI::ParseError& error) {
    return app.exit(error) == 0 ? exitDone : exitBadUse;
  }
  for (const Command* command : commands) {
    if (app.got_subcommand(command->name)) return runCommand(*command, arguments);
  }
  return exitBadUse;
}
