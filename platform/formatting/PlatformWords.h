// Internal to this folder: the few words that numbers and durations need of the platform's string table.
// Main thread only.
#pragma once

#include <string>
#include <string_view>

namespace ax::formatting {

// The text of a key in the current region's language; "" for a key that the table lacks.
std::string platformWord(std::string_view key);

}  // namespace ax::formatting
