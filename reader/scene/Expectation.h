#pragma once

#include <nlohmann/json.hpp>
#include <optional>
#include <string>
#include <vector>

namespace ax::reader {

// One place at which a reply is not what was expected.
struct Difference {
  std::string place;                               // a JSON pointer into the scene
  std::optional<nlohmann::ordered_json> expected;  // nothing: nothing more was expected
  std::optional<nlohmann::ordered_json> found;     // nothing: there is none
};

// Every place at which the reply differs, under the pointer `place`. An expected object may leave members
// out; lists are compared whole, and numbers by their value.
std::vector<Difference> differences(const nlohmann::ordered_json& expected,
                                    const nlohmann::ordered_json& found, const std::string& place);

// What is to be expected from now on: the reply, without the members that the former expectation leaves out.
nlohmann::ordered_json accepted(const nlohmann::ordered_json& expected, const nlohmann::ordered_json& found);

}  // namespace ax::reader
