// Figures of any script.
#pragma once

#include <cstdint>
#include <string_view>

namespace ax::formatting {

// The number that decimal digits of any script write, or the largest one where it is larger. Characters that
// are no digits are passed over. Any thread.
std::int64_t wholeNumber(std::string_view digits);

}  // namespace ax::formatting
