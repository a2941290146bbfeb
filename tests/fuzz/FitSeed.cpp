#include <iostream>

#include "tests/reader/FitWriter.h"

// Prints a small FIT file for the fuzzer to start from: records, laps and a session.
int main() {
  using namespace ax::reader::testing;
  const std::int64_t start = fitTime(1772953200);
  FitWriter file;
  file.define(0, 20, {{253, fitU32, 4}, {0, fitS32, 4}, {1, fitS32, 4}, {3, fitU8, 1}, {5, fitU32, 4}}, 3);
  for (int i = 0; i <= 60; i += 20) file.add(0, {start + i, 596523000 + i * 40, 119304600, 120 + i, i * 300});
  file.define(1, 21, {{253, fitU32, 4}, {0, fitEnum, 1}, {1, fitEnum, 1}, {3, fitU32, 4}});
  file.add(1, {start, 0, 0, 0}).add(1, {start + 30, 0, 4, 0}).add(1, {start + 40, 0, 0, 0});
  file.define(2, 19, {{253, fitU32, 4}, {2, fitU32, 4}, {8, fitU32, 4}, {9, fitU32, 4}, {23, fitEnum, 1}});
  file.add(2, {start + 60, start, 50000, 18000, 0});
  file.define(3, 18, {{253, fitU32, 4}, {2, fitU32, 4}, {5, fitEnum, 1}, {8, fitU32, 4}, {9, fitU32, 4}});
  file.add(3, {start + 60, start, 1, 50000, 18000});
  std::cout << file.file();
}
