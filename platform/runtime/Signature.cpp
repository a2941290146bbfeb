#include "platform/runtime/Signature.h"

#include <deque>
#include <map>
#include <mutex>

namespace ax {

const Signature& internSignature(const std::type_info& type, const Signature& signature) {
  static std::mutex mutex;
  static auto* const signatures = new std::map<std::string, Signature, std::less<>>;
  const std::lock_guard lock(mutex);
  return signatures->try_emplace(type.name(), signature).first->second;
}

}  // namespace ax
