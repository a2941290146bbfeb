#pragma once

#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "platform/runtime/Object.h"

namespace ax::reader {

// A function that the bundle's module exports, as it is called with boxed arguments.
struct ExportedFunction {
  std::string_view name;
  std::vector<std::string_view> encodings;      // type codes: the result first, then the arguments
  bool (*takes)(std::span<const Ref<Object>>);  // whether objects are of the classes that it takes
  Ref<Object> (*call)(void* function, std::span<const Ref<Object>>);  // as many arguments as it takes
};

// Null for a name that the bundle does not export.
const ExportedFunction* exportedFunction(std::string_view name);
// "accessibilityLocalizedString, ..."
std::string exportedNames();

}  // namespace ax::reader
