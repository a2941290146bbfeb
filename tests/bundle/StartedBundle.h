#pragma once

#include "platform/foundation/Environment.h"

namespace ax {

// Opens the module that the build laid out beside the tests and starts it, once in the process.
void startBundle();

// The environment for the length of a test.
class EnvironmentScope {
 public:
  explicit EnvironmentScope(Environment environment) { setEnvironment(std::move(environment)); }
  ~EnvironmentScope() { setEnvironment(before_); }

 private:
  Environment before_ = environment();
};

}  // namespace ax
