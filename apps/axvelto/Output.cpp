#include "apps/axvelto/Output.h"

#include <iostream>

namespace ax::app {

void print(const nlohmann::ordered_json& json) {
  std::cout << json.dump(2, ' ', false, nlohmann::ordered_json::error_handler_t::replace) << '\n';
}

void print(const std::vector<std::string>& lines) {
  for (const std::string& line : lines) std::cout << line << '\n';
}

}  // namespace ax::app
