#pragma once

#include <CLI/CLI.hpp>
#include <functional>
#include <string>
#include <vector>

#include "apps/shared/Opening.h"

namespace ax::app {

// What a command ends with.
enum ExitCode : int { exitDone = 0, exitFallsShort = 1, exitBadUse = 2 };

// What the command line gave; each command fills what it takes.
struct Arguments : Opening {
  bool asJson = false;
  std::string chart;     // the id of one object whose charts are wanted
  std::string output;    // the file to write; empty: standard output
  bool accepts = false;  // writes what was found into the scene
  bool listsRules = false;
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

extern const Command speakCommand, treeCommand, graphCommand, checkCommand, askCommand, importCommand,
    auditCommand, pageCommand, soundCommand;

// What several commands take.
void declareFile(CLI::App& app, Arguments& arguments);
void declareLocale(CLI::App& app, Arguments& arguments);
// The time zone, and how workout files are read.
void declareWorkouts(CLI::App& app, Arguments& arguments);
void declareWithout(CLI::App& app, Arguments& arguments);
void declareChart(CLI::App& app, Arguments& arguments);
void declareJson(CLI::App& app, Arguments& arguments);

}  // namespace ax::app
