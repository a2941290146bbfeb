#include "platform/accessibility/BundleLoader.h"

#include <dlfcn.h>

#include "platform/foundation/Array.h"
#include "platform/runtime/Message.h"

namespace ax {

namespace {

constinit const Message<Ref<Array>()> accessibilityBundles{"accessibilityBundles"};
constinit const Message<void()> accessibilityInitializeBundle{"accessibilityInitializeBundle"};

// The modules that have been opened; they stay open.
std::vector<void*>& openModules() {
  static auto* const modules = new std::vector<void*>;
  return *modules;
}

}  // namespace

std::unique_ptr<LoadedBundle> LoadedBundle::open(const std::string& modulePath,
                                                 const std::string& principalClass, std::string& error) {
  void* handle = dlopen(modulePath.c_str(), RTLD_NOW | RTLD_LOCAL);
  if (handle == nullptr) {
    error = dlerror();
    return nullptr;
  }
  Class* principal = Class::named(principalClass);
  if (principal == nullptr || dlsym(handle, principalClass.c_str()) == nullptr) {
    error = modulePath + ": no class " + principalClass + " in this module";
    return nullptr;
  }
  openModules().push_back(handle);
  return std::unique_ptr<LoadedBundle>(new LoadedBundle(handle, *principal));
}

void LoadedBundle::start() const {
  accessibilityBundles(principal_);
  accessibilityInitializeBundle(principal_);
}

void* LoadedBundle::symbol(const std::string& name) const {
  return dlsym(handle_, name.c_str());
}

void* LoadedBundle::exportedSymbol(const std::string& name) {
  for (void* module : openModules()) {
    if (void* found = dlsym(module, name.c_str())) return found;
  }
  return nullptr;
}

}  // namespace ax
