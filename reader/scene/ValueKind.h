#pragma once

#include <string>
#include <string_view>

#include "platform/runtime/Object.h"

namespace ax::reader {

// Whether a boxed value is one for a type code: a boolean for "B", a whole number in range for "q", "Q", "i"
// and "I", any number for "d" and "f", its own kind of geometry or selector. Objects of every class, and nil,
// fit "@"; nil fits no scalar, and nothing but nil a block.
bool fits(const Ref<Object>& value, std::string_view code);

// What fits, in words: "true or false".
std::string kindInWords(std::string_view code);

}  // namespace ax::reader
