#include <iostream>
#include <string_view>

#include "apps/axvelto/Command.h"
#include "apps/shared/Complaint.h"
#include "reader/text/Fault.h"
#include "reader/text/PlainText.h"

namespace {

using namespace ax::app;

const Command* const commands[] = {&speakCommand,  &treeCommand,  &graphCommand, &checkCommand, &askCommand,
                                   &importCommand, &auditCommand, &pageCommand,  &soundCommand};

std::string usageFailure(const CLI::App* app, const CLI::Error& error) {
  const std::vector<std::string> left = app->remaining();
  const bool isUnknownCommand = app->get_subcommands().empty() && !left.empty();
  if (std::string_view(error.what()).starts_with("FILE: At Most 1")) {
    return "axvelto: one FILE at a time; import makes a list of several (axvelto --help tells the use)\n";
  }
  const std::string what = isUnknownCommand ? "unknown command \"" + left.front() + "\"" : error.what();
  return "axvelto: " + ax::reader::printable(ax::reader::shortened(what)) +
         " (axvelto --help tells the use)\n";
}

int runCommand(const Command& command, const Arguments& arguments) {
  try {
    const ExitCode code = command.run(arguments);
    if (std::cout.flush()) return code;
    complain("standard output: cannot be written, expected room for the result");
  } catch (const ax::reader::Fault& fault) {
    complain(fault);
  } catch (const std::exception& error) {
    complain(std::string(command.name) + ": " + error.what());
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
