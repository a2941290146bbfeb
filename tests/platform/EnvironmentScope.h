#pragma once

#include <utility>

#include "platform/foundation/Environment.h"

namespace ax {

// The environment for the length of a test.
class EnvironmentScope {
 public:
  explicit EnvironmentScope(Environment environment) { setEnvironment(std::move(environment)); }
  ~EnvironmentScope() { setEnvironment(before_); }

 private:
  Environment before_ = environment();
};

}  // namespace ax
