#include <gtest/gtest.h>

#include "platform/foundation/Environment.h"

namespace {

// Each test begins in the environment of the process, whatever the one before it left.
class SameEnvironment : public testing::EmptyTestEventListener {
  void OnTestEnd(const testing::TestInfo&) override { ax::setEnvironment(environment_); }

  const ax::Environment environment_ = ax::environment();
};

}  // namespace

int main(int count, char** arguments) {
  testing::InitGoogleTest(&count, arguments);
  testing::UnitTest::GetInstance()->listeners().Append(new SameEnvironment);
  return RUN_ALL_TESTS();
}
