#pragma once

#include <string>

namespace bench {

// Start-up happens once in a process, so each measurement is a process of its own. Medians, in microseconds.
struct StartUp {
  double generated = 0;  // 65 categories made for the purpose, checked and grafted
  double classes = 0;    // a shared library of 65 classes, opened
  double bundle = 0;     // the bundle over the host model; 0 when they are not built
  double opening = 0;    // and its opening before that
  int bundleCategories = 0;
};
StartUp measureStartUp(const std::string& program);

// What such a process does: prints its figures to standard output. "nothing", "host" and "opened" print none:
// they stop before the classes, the bundle and its start.
int runStartUpChild(const std::string& kind, const std::string& program);

}  // namespace bench
