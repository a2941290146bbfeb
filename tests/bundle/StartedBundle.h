#pragma once

#include <memory>
#include <string>

#include "platform/accessibility/BundleLoader.h"

namespace ax {

// Opens the module that the build laid out beside the tests. Null, and a failure of the test, without one.
std::unique_ptr<LoadedBundle> openBundle();
// The same, and starts it, once in the process.
void startBundle();

// How many categories it brings: those that tests/contract/checks.txt lists.
std::size_t categoryCount();

// A function of the module that has been opened, by the name and type under which the module exports it.
template <class Function>
Function* exported(const std::string& name) {
  return reinterpret_cast<Function*>(LoadedBundle::exportedSymbol(name));
}

}  // namespace ax
