#pragma once

#include <memory>
#include <string>

#include "platform/runtime/Class.h"

namespace ax {

// An accessibility bundle that has been opened. It stays in the process; this is only the way to it.
class LoadedBundle {
 public:
  // Opens the module and finds its principal class. On failure the result is null and `error` says why.
  static std::unique_ptr<LoadedBundle> open(const std::string& modulePath, const std::string& principalClass,
                                            std::string& error);

  // Asks the principal class for further bundles, then starts this one: at most once in a process, whoever
  // asks and however often. Any thread may call it; it returns when start-up is over.
  void start() const;

  Class& principalClass() const { return principal_; }
  // An exported function, or null.
  void* symbol(const std::string& name) const;
  // The same in whichever open bundle exports it.
  static void* exportedSymbol(const std::string& name);

 private:
  LoadedBundle(void* handle, Class& principal) : handle_(handle), principal_(principal) {}

  void* handle_;
  Class& principal_;
};

}  // namespace ax
