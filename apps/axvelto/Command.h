#pragma once

#include <CLI/CLI.hpp>
#include <functional>
#include <string>
#include <vector>

namespace ax::app {

// What a command ends with.
enum ExitCode : int { exitDone = 0, exitFallsShort = 1, exitBadUse = 2 };

// What the command line gave; each command fills what it takes.
struct Arguments {
  std::vector<std::string> files;    // paths, or "-" for standard input
  std::string locale;                // empty: the scene's
  std::string timeZone;              // of imported workouts; empty: UTC
  std::vector<std::string> without;  // classes and members that the host does without
  bool asJson = false;
  std::string chart;  // the id of one object whose charts are wanted
  std::string activate, increment, decrement;
  std::vector<double> point;  // two coordinates, or none
};

// One command of the program: `declare` adds what it takes to the command line, `run` prints to standard
// output and answers the exit code, or throws a reader::Fault.
struct Command {
  const char* name;
  const char* help;
  void (*declare)(CLI::App&, Arguments&);
  ExitCode (*run)(const Arguments&);
};

extern const Command speakCommand, treeCommand, graphCommand, checkCommand, askCommand, importCommand;

// What several commands take.
void declareFile(CLI::App& app, Arguments& arguments);
void declareLocale(CLI::App& app, Arguments& arguments);
void declareWithout(CLI::App& app, Arguments& arguments);
void declareJson(CLI::App& app, Arguments& arguments);

}  // namespace ax::app
