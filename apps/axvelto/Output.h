#pragma once

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

namespace ax::app {

// To standard output; bytes that are no UTF-8 become U+FFFD.
void print(const nlohmann::ordered_json& json);
void print(const std::vector<std::string>& lines);

}  // namespace ax::app
