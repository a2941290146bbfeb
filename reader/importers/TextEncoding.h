#pragma once

#include <string>
#include <string_view>

namespace ax::reader {

bool isUtf8(std::string_view bytes);

// The text without its byte-order mark, which may follow blanks. UTF-16 is known by its mark or by the zero
// byte beside the first character; anything else that is not UTF-8 is taken as Latin-1, whatever the file
// says of itself.
std::string toUtf8(std::string_view bytes);

}  // namespace ax::reader
