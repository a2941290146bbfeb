#pragma once

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <string>

namespace ax {

// For a test that needs a process in which no other test has run, or whose traces stay for the life of one.
// As the only test of its process it runs here and the answer is no. Else it runs in a new process, its
// failure fails the caller, and the answer is yes: the test is over.
inline bool ranInOwnProcess() {
  const testing::UnitTest& all = *testing::UnitTest::GetInstance();
  if (all.test_to_run_count() == 1) return false;
  const testing::TestInfo& test = *all.current_test_info();
  const std::string program = std::filesystem::read_symlink("/proc/self/exe").string();
  const std::string name = std::string(test.test_suite_name()) + "." + test.name();
  EXPECT_EQ(std::system(("'" + program + "' --gtest_brief=1 '--gtest_filter=" + name + "'").c_str()), 0);
  return true;
}

}  // namespace ax
