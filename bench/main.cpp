#include <algorithm>
#include <cstdio>

#include "bench/BundleSides.h"
#include "bench/Comparison.h"
#include "bench/Instructions.h"
#include "bench/Pages.h"
#include "bench/Report.h"
#include "bench/Sides.h"
#include "bench/Sizes.h"
#include "bench/StartUp.h"
#include "bench/Walk.h"
#include "platform/runtime/Object.h"

namespace bench {

namespace {

const Operation operations[] = {
    {"send", "typed send, cached class", {{"floor", 2.5}}},
    {"super", "override that calls super", {{"floor", 5}}},
    {"read literal", "read by a literal key", {{"floor", 2}}},
    {"read text",
     "read by a key that arrives at run time",
     {{"floor", 1.5}, {"Qt", 1 / 5.0}, {"GLib", 1 / 5.0}, {"RTTR", 1}}},
    {"class", "class by a literal name"},
    {"get", "stored value, get", {{"Qt", 1 / 10.0}, {"GLib", 1 / 10.0}}},
    {"set", "stored value, set"},
    {"walk 1000", "walk, per node of 1,000"},
    {"walk 10000", "walk, per node of 10,000", {{"floor", 2}, {"ATK", 1 / 4.0}}},
    {"walk 100000", "walk, per node of 100,000"},
    {"fit", "workout file in FIT, per MB"},
    {"tcx", "workout file in TCX, per MB"},
    {"gpx", "workout file in GPX, per MB"},
};

void compareSizes(std::vector<Row>& rows) {
  const Sizes sizes = measureSizes();
  rows.push_back({"an Object", "bytes", sizeof(ax::Object), "bound", 32, 1});
  rows.push_back({"an Object, with the allocator's share",
                  "bytes",
                  sizes.object,
                  "the object itself",
                  sizeof(ax::Object),
                  {}});
  rows.push_back({"one stored value more, on the heap", "bytes", sizes.storedValue, "bound", 48, 1});
  rows.push_back({"a View, on the heap", "bytes", sizes.view, "bound", 256, 1});
}

void compareStartUp(const std::string& program, std::vector<Row>& rows, std::vector<std::string>& notes) {
  const StartUp startUp = measureStartUp(program);
  const double bound = std::max(300.0, startUp.classes);
  rows.push_back(
      {"start-up, 65 generated categories", "us", startUp.generated, "300 us, or a library", bound, 1});
  rows.push_back({"start-up, 65 generated categories",
                  "us",
                  startUp.generated,
                  "opening 65 classes",
                  startUp.classes,
                  {}});
  if (startUp.bundle == 0)
    return notes.push_back("the bundle or the host is not built: its start-up is skipped");
  const std::string title =
      "start-up, the bundle (" + std::to_string(startUp.bundleCategories) + " installed)";
  rows.push_back({title, "us", startUp.bundle, "300 us, or a library", bound, 1});
  rows.push_back(
      {"opening the bundle before that", "us", startUp.opening, "opening 65 classes", startUp.classes, {}});
}

void measureBundle(const std::string& program, std::vector<Row>& rows, std::vector<std::string>& notes) {
  if (!openBundleForSides(program)) return notes.push_back("the bundle is not built: its charts are skipped");
  runSides();
  compareBundleSides(rows);
}

std::vector<std::string> missingPeers() {
  std::vector<std::string> notes;
#ifdef AXVELTO_WITHOUT_Qt
  notes.push_back("Qt 6 is not installed: skipped");
#endif
#ifdef AXVELTO_WITHOUT_RTTR
  notes.push_back("RTTR is not installed: skipped");
#endif
#ifdef AXVELTO_WITHOUT_GLib
  notes.push_back("GLib is not installed: skipped");
#endif
#ifdef AXVELTO_WITHOUT_ATK
  notes.push_back("ATK is not installed: skipped");
#endif
  return notes;
}

void print(const std::vector<Row>& rows, const std::vector<std::string>& notes, bool json) {
  std::fputs((json ? asJson(rows, notes) : asText(rows, notes)).c_str(), stdout);
}

int countInstructions(const std::string& program, bool json) {
  std::vector<Row> rows;
  std::vector<std::string> notes;
  compareInstructions(program, rows, notes);
  print(rows, notes, json);
  return rows.empty() ? 1 : 0;
}

int run(const std::string& program, bool json) {
  std::vector<Row> rows;
  std::vector<std::string> notes = missingPeers();
  runSides();
  for (const Operation& operation : operations) compare(operation, rows);
  compareGrowth(
      {"walk, growth per node from 1,000 to 100,000", walkName(walkSizes[0]), walkName(walkSizes[2]), 1.25},
      rows);
  comparePages(rows);
  compareSizes(rows);
  compareStartUp(program, rows, notes);
  measureBundle(program, rows, notes);
  print(rows, notes, json);
  return 0;
}

}  // namespace

}  // namespace bench

int main(int count, char** arguments) {
  const std::vector<std::string> options(arguments + 1, arguments + count);
  const auto has = [&](const char* option) {
    return std::find(options.begin(), options.end(), option) != options.end();
  };
  const std::string program = arguments[0];
  if (options.size() == 2 && options[0] == "--start-up") return bench::runStartUpChild(options[1], program);
  if (options.size() == 4 && options[0] == "--repeat") {
    return bench::repeatSide(program, options[1], options[2], std::stoi(options[3])) ? 0 : 1;
  }
  const bool json = has("--json"), instructions = has("--instructions");
  if (options.size() != std::size_t(json) + std::size_t(instructions)) {
    std::fputs("usage: axvelto-bench [--instructions] [--json]\n", stderr);
    return 2;
  }
  return instructions ? bench::countInstructions(program, json) : bench::run(program, json);
}
