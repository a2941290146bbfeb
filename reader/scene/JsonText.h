#pragma once

#include <nlohmann/json.hpp>
#include <string>
#include <string_view>

#include "reader/text/Fault.h"

namespace ax::reader {

using Json = nlohmann::ordered_json;

// Reads JSON, strictly: a key that stands twice in one object, values nested deeper than 100, numbers that no
// double holds and bytes that are no UTF-8 are faults like every other error of syntax, with line and column.
// Throws a Fault.
Json readJson(std::string_view text, const std::string& file);

}  // namespace ax::reader
