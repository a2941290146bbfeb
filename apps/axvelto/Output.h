#pragma once

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

namespace ax::app {

// To standard output. What a terminal would obey stands as escapes, also in JSON, where they mean the same;
// bytes that are no UTF-8 become U+FFFD.
void print(const nlohmann::ordered_json& json);
void print(const std::vector<std::string>& lines);
void printText(const std::string& text);  // of whole lines

}  // namespace ax::app
