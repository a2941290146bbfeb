#pragma once

#include <string>
#include <string_view>

namespace ax::reader {

bool isUtf8(std::string_view bytes);

// The text without its byte-order mark, which may follow blanks. UTF-16 is known by its mark or by the zero
// byte beside the first character; otherwise the encoding counts that an XML declaration names. Without one
// the text is UTF-8, or where no byte beyond ASCII belongs to a character of it, windows-1252. A byte that
// stands for nothing becomes U+FFFD and changes nothing else. `kept` holds the text where it is not the bytes
// themselves.
std::string_view toUtf8(std::string_view bytes, std::string& kept);

}  // namespace ax::reader
