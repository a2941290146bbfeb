#include "platform/accessibility/Contract.h"

namespace ax {

bool Contract::exists() const {
  return manager_.validateClass(className_);
}

bool Contract::isKindOf(std::string_view baseName) const {
  return manager_.validateClassIsKindOfClass(className_, baseName);
}

bool Contract::conformsTo(std::string_view protocol) const {
  return manager_.validateClassConformsToProtocol(className_, protocol);
}

bool Contract::instanceVariable(std::string_view name, std::string_view type) const {
  return manager_.validateClassHasInstanceVariableWithType(className_, name, type);
}

bool Contract::instanceMethod(std::string_view name, Signature signature) const {
  return manager_.validateClassHasInstanceMethodWithFullSignature(className_, name, signature);
}

bool Contract::classMethod(std::string_view name, Signature signature) const {
  return manager_.validateClassHasClassMethodWithFullSignature(className_, name, signature);
}

}  // namespace ax
