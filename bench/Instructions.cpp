#include "bench/Instructions.h"

#include <cmath>
#include <cstdio>

#include "bench/BundleSides.h"
#include "bench/Sides.h"
#include "bench/Walk.h"

namespace bench {

namespace {

struct Counted {
  std::string operation;
  std::string title;
  int times;
  double most = 0;                   // instructions; 0: no bound
  std::optional<double> ratio = {};  // to the floor
  std::string larger = {};           // the same of more, whose growth is bounded
  bool isInLoop = false;             // one a turn: the turn itself is not counted
};

constexpr double mostGrowth = 1.25;

std::vector<Counted> countedOperations() {
  const std::string month = sized("month ", monthSizes[0]), months = sized("month ", monthSizes[2]);
  const std::string slices = sized("slices ", readingSizes[0]), more = sized("slices ", readingSizes[1]);
  return {{"send", "typed send, cached class", 40, 22, {}, {}, true},
          {"super", "override that calls super", 40, 50, {}, {}, true},
          {"read literal", "read by a literal key", 40, 42},
          {"read text", "read by a key that arrives at run time", 40, 131},
          {"get first", "stored value, get the first", 40, 19},
          {"class", "class by a literal name", 40, 45},
          {walkName(walkSizes[1]), "walk, per node of 10,000", 1, 0, 1.7},
          {"move chart 8", "move chart of 8, per element", 20, 0, 1.5},
          {month, "month, per day of 42", 10, 0, 2, months},
          {slices, "8 slices, per reading of 10000", 1, 0, 2, more}};
}

// How many instructions a run of this program takes; 0 when it cannot be had.
double instructionsOf(const std::string& program, const std::string& arguments) {
  const std::string command = "valgrind --tool=callgrind --callgrind-out-file=/dev/null '" + program + "' " +
                              arguments + " 2>&1 >/dev/null";
  std::FILE* child = popen(command.c_str(), "r");
  if (child == nullptr) return 0;
  double collected = 0;
  char line[256];
  while (std::fgets(line, sizeof line, child) != nullptr)
    std::sscanf(line, "==%*d== Collected : %lf", &collected);
  return pclose(child) == 0 ? collected : 0;
}

// Per item. The first time makes what the side works on.
double instructionsPerItem(const std::string& program, const std::string& operation, const std::string& side,
                           int times) {
  const auto run = [&](int count) {
    return instructionsOf(program, "--repeat '" + operation + "' " + side + " " + std::to_string(count));
  };
  const double once = run(1);
  const double often = run(1 + times);
  const Side* measured = sideOf(operation, side);
  if (measured == nullptr) return 0;
  return once == 0 || often == 0 ? 0 : (often - once) / times / measured->items;
}

void addRow(const Row& row, std::vector<Row>& rows, std::vector<std::string>& notes) {
  if (row.ours > 0 && row.other > 0) return rows.push_back(row);
  notes.push_back(row.operation + ": not counted");
}

void compareGrowth(const std::string& program, const Counted& counted, double small, std::vector<Row>& rows,
                   std::vector<std::string>& notes) {
  if (counted.larger.empty()) return;
  const double large = instructionsPerItem(program, counted.larger, "ours", 1);
  addRow({counted.larger + ", growth per item", "instr", large, counted.operation, small, mostGrowth}, rows,
         notes);
}

void compareOperation(const std::string& program, const Counted& counted, double loop, std::vector<Row>& rows,
                      std::vector<std::string>& notes) {
  const auto count = [&](const char* side) {
    const double all = instructionsPerItem(program, counted.operation, side, counted.times);
    return counted.isInLoop ? all - loop : all;
  };
  const double ours = count("ours");
  addRow({counted.title, "instr", ours, "floor", count("floor"), counted.ratio}, rows, notes);
  // The count of a whole batch holds a few instructions of its own: bounds are whole numbers.
  if (counted.most > 0)
    addRow({counted.title, "instr", std::round(ours), "bound", counted.most, 1}, rows, notes);
  compareGrowth(program, counted, ours, rows, notes);
}

// In thousands: one opening is a million instructions.
void compareStartUp(const std::string& program, std::vector<Row>& rows, std::vector<std::string>& notes) {
  const auto run = [&](const char* kind) {
    return instructionsOf(program, std::string("--start-up ") + kind) / 1000;
  };
  const double nothing = run("nothing"), opened = run("opened");
  const double classes = run("classes") - nothing;
  addRow({"opening the module", "k in.", opened - run("host"), "opening 65 classes", classes, 1.5}, rows,
         notes);
  addRow({"starting it", "k in.", run("bundle") - opened, "opening 65 classes", classes, {}}, rows, notes);
}

}  // namespace

void compareInstructions(const std::string& program, std::vector<Row>& rows,
                         std::vector<std::string>& notes) {
  if (!openBundleForSides(program)) return notes.push_back("the bundle is not built: nothing is counted");
  const double loop = instructionsPerItem(program, "loop", "ours", 40);
  for (const Counted& counted : countedOperations()) compareOperation(program, counted, loop, rows, notes);
  compareStartUp(program, rows, notes);
}

bool repeatSide(const std::string& program, const std::string& operation, const std::string& side,
                int times) {
  const Side* found = sideOf(operation, side);
  if (found == nullptr && openBundleForSides(program)) found = sideOf(operation, side);
  if (found != nullptr) found->repeat(times);
  return found != nullptr;
}

}  // namespace bench
