#include "tests/bundle/StartedBundle.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>

#include "host/core/HostApp.h"
#include "tests/tour/Samples.h"

namespace ax {

std::unique_ptr<LoadedBundle> openBundle() {
  host::linkHost();
  const auto tests = std::filesystem::read_symlink("/proc/self/exe").parent_path();
  std::string error;
  auto bundle = LoadedBundle::open(tests / "../lib/AXVelto/AXVelto.so", "AXVeltoGlue", error);
  EXPECT_NE(bundle, nullptr) << error;
  return bundle;
}

void startBundle() {
  const auto bundle = openBundle();
  ASSERT_NE(bundle, nullptr);
  bundle->start();
}

// Each stands at the beginning of a line, with its checks behind blanks; the first line is of none.
std::size_t categoryCount() {
  std::ifstream table(tour::samplesFolder().parent_path() / "tests/contract/checks.txt");
  std::size_t count = 0;
  for (std::string line; std::getline(table, line);) {
    if (!line.starts_with(' ') && !line.starts_with('(')) ++count;
  }
  return count;
}

}  // namespace ax
