#include "tests/bundle/StartedBundle.h"

#include <gtest/gtest.h>

#include <filesystem>

#include "host/core/HostApp.h"

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

}  // namespace ax
