#pragma once

#include "platform/accessibility/ValidationManager.h"

namespace ax {

// What a category relies on in the host, check by check: of its own target class, or of another one by its
// name. Each answers whether it holds; the manager keeps them all. Made for the time of the checks.
//
//   contract.instanceVariable("_value", "Label");
//   contract.of("Quantity").instanceMethod("ch_beatsPerMinute", {"d"});
class Contract {
 public:
  using Signature = ValidationManager::FullSignature;

  // The name must outlive it.
  Contract(ValidationManager& manager, std::string_view className)
      : manager_(manager), className_(className) {}

  Contract of(std::string_view otherClass) const { return {manager_, otherClass}; }

  bool exists() const;
  bool isKindOf(std::string_view baseName) const;
  bool conformsTo(std::string_view protocol) const;
  bool instanceVariable(std::string_view name, std::string_view type) const;
  // Blanks in names of methods do not count.
  bool instanceMethod(std::string_view name, Signature signature) const;
  bool classMethod(std::string_view name, Signature signature) const;

 private:
  ValidationManager& manager_;
  std::string_view className_;
};

}  // namespace ax
