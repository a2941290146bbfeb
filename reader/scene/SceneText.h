#pragma once

#include <nlohmann/json.hpp>
#include <string>
#include <string_view>

// Scenes as people write them: text with a layout of its own.
namespace ax::reader {

// JSON on one line where it fits into what is left of a line, else an item a line. `column` is where the
// value begins, and `indent` where the line begins that it stands on.
std::string laidOut(const nlohmann::ordered_json& value, std::size_t column, std::size_t indent);

// The text of a scene with one member of one of its objects set, everything else untouched. The object is
// named by a JSON pointer ("/steps/3"; "" is the scene itself). Throws a Fault when the text cannot be
// changed without changing more than that.
std::string withMember(const std::string& text, const std::string& object, const std::string& key,
                       const nlohmann::ordered_json& value, const std::string& file);

}  // namespace ax::reader
