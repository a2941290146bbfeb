#include "apps/axvelto/Output.h"

#include <iostream>
#include <sstream>

#include "reader/text/PlainText.h"

namespace ax::app {

void print(const nlohmann::ordered_json& json) {
  printText(json.dump(2, ' ', false, nlohmann::ordered_json::error_handler_t::replace));
}

void print(const std::vector<std::string>& lines) {
  for (const std::string& line : lines) std::cout << reader::printable(line) << '\n';
}

void printText(const std::string& text) {
  std::istringstream lines(text);
  for (std::string line; std::getline(lines, line);) std::cout << reader::printable(line) << '\n';
}

}  // namespace ax::app
