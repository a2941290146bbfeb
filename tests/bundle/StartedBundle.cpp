#include "tests/bundle/StartedBundle.h"

#include <gtest/gtest.h>

#include <filesystem>

#include "host/core/HostApp.h"
#include "platform/accessibility/BundleLoader.h"

namespace ax {

void startBundle() {
  host::linkHost();
  const auto tests = std::filesystem::read_symlink("/proc/self/exe").parent_path();
  std::string error;
  const auto bundle = LoadedBundle::open(tests / "../lib/AXVelto/AXVelto.so", "AXVeltoGlue", error);
  ASSERT_NE(bundle, nullptr) << error;
  bundle->start();
}

}  // namespace ax
