#include <cstdio>
#include <cstring>

#include "bench/BundleSides.h"
#include "bench/Comparison.h"
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
    {"get", "stored value, get", {{"Qt", 1 / 10.0}, {"GLib", 1 / 10.0}}},
    {"set", "stored value, set"},
    {"walk 1000", "walk, per node of 1,000"},
    {"walk 10000", "walk, per node of 10,000", {{"floor", 2}, {"ATK", 1 / 4.0}}},
    {"walk 100000", "walk, per node of 100,000"},
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

int run(const std::string& program, bool json) {
  std::vector<Row> rows;
  std::vector<std::string> notes = missingPeers();
  runSides();
  for (const Operation& operation : operations) compare(operation, rows);
  compareGrowth(
      {"walk, growth per node from 1,000 to 100,000", walkName(walkSizes[0]), walkName(walkSizes[2]), 1.25},
      rows);
  compareSizes(rows);
  compareStartUp(program, rows, notes);
  measureBundle(program, rows, notes);
  std::fputs((json ? asJson(rows, notes) : asText(rows, notes)).c_str(), stdout);
  return 0;
}

}  // namespace

}  // namespace bench

int main(int count, char** arguments) {
  if (count == 3 && std::strcmp(arguments[1], "--start-up") == 0) {
    return bench::runStartUpChild(arguments[2], arguments[0]);
  }
  const bool json = count == 2 && std::strcmp(arguments[1], "--json") == 0;
  if (count > 1 && !json) {
    std::fputs("usage: axvelto-bench [--json]\n", stderr);
    return 2;
  }
  return bench::run(arguments[0], json);
}
