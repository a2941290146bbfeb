// Texts in the encodings of other programs.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace ax::formatting {

// The bytes as UTF-8, read in an encoding by any of its usual names, such as "KOI8-R"; what stands for no
// character becomes U+FFFD. Nothing for a name that is not known.
std::optional<std::string> utf8FromEncoding(std::string_view bytes, const std::string& encoding);

}  // namespace ax::formatting
