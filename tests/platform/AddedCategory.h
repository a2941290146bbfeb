#pragma once

#include <string>
#include <vector>

#include "platform/accessibility/CategoryRegistration.h"

namespace ax {

// What a test makes a category of: texts and rows that need not outlive the call.
struct AddedCategory {
  std::string name;
  std::string target;
  std::vector<Override> overrides = {};
  void (*validations)(const Contract&) = nullptr;
  std::string screen = "Tests";
};

inline Class& addCategory(AddedCategory category) {
  const auto& kept = *new AddedCategory(std::move(category));
  return registerCategory(
      *new CategoryRecord{kept.name, kept.target, kept.screen, kept.validations, kept.overrides});
}

}  // namespace ax
