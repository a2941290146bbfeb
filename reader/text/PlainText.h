#pragma once

#include <string>
#include <string_view>

// Texts of strangers on the way to a terminal.
namespace ax::reader {

// One line that a terminal shows and does not obey: control characters, ends of lines and whatever turns the
// direction of writing stand as escapes such as \u001b, bytes that are no UTF-8 as U+FFFD.
std::string printable(std::string_view text);

// At most a thousand characters, and then how many there were.
std::string shortened(std::string_view text);

}  // namespace ax::reader
