#include "platform/runtime/Signature.h"

#include <deque>
#include <map>
#include <mutex>
#include <set>
#include <typeindex>

namespace ax {

const void* internType(const std::type_info& type) {
  static std::mutex mutex;
  static auto* const types = new std::set<std::type_index>;
  const std::lock_guard lock(mutex);
  return &*types->emplace(type).first;
}

const Signature& internSignature(const std::type_info& type, const Signature& signature) {
  static std::mutex mutex;
  static auto* const signatures = new std::map<std::string, Signature, std::less<>>;
  const std::lock_guard lock(mutex);
  return signatures->try_emplace(type.name(), signature).first->second;
}

}  // namespace ax
