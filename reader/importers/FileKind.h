#pragma once

#include <string>
#include <string_view>

namespace ax::reader {

// What a file is, as its first bytes tell.
enum class FileKind { empty, fit, xml, json, gzip, zip, other };

FileKind kindOfFile(std::string_view bytes);

// In words: "a PNG picture", "an empty file", "a file of an unknown kind".
std::string nameOfKind(std::string_view bytes);

}  // namespace ax::reader
