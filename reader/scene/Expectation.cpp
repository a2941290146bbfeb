#include "reader/scene/Expectation.h"

#include <algorithm>

#include "reader/scene/JsonNode.h"

namespace ax::reader {

namespace {

void compare(const Json& expected, const Json& found, const std::string& place,
             std::vector<Difference>& differences);

void compareMembers(const Json& expected, const Json& found, const std::string& place,
                    std::vector<Difference>& differences) {
  for (const auto& [key, value] : expected.items()) {
    const std::string member = place + "/" + escapedForPointer(key);
    if (found.contains(key)) {
      compare(value, found[key], member, differences);
    } else {
      differences.push_back({member, value, std::nullopt});
    }
  }
}

void compareItems(const Json& expected, const Json& found, const std::string& place,
                  std::vector<Difference>& differences) {
  for (std::size_t i = 0; i < std::max(expected.size(), found.size()); ++i) {
    const std::string item = place + "/" + std::to_string(i);
    if (i >= found.size()) {
      differences.push_back({item, expected[i], std::nullopt});
    } else if (i >= expected.size()) {
      differences.push_back({item, std::nullopt, found[i]});
    } else {
      compare(expected[i], found[i], item, differences);
    }
  }
}

void compare(const Json& expected, const Json& found, const std::string& place,
             std::vector<Difference>& differences) {
  if (expected.is_object() && found.is_object()) {
    compareMembers(expected, found, place, differences);
  } else if (expected.is_array() && found.is_array()) {
    compareItems(expected, found, place, differences);
  } else if (expected != found) {
    differences.push_back({place, expected, found});
  }
}

}  // namespace

std::vector<Difference> differences(const Json& expected, const Json& found, const std::string& place) {
  std::vector<Difference> all;
  compare(expected, found, place, all);
  return all;
}

Json accepted(const Json& expected, const Json& found) {
  if (expected.is_array() && found.is_array() && expected.size() == found.size()) {
    Json items = Json::array();
    for (std::size_t i = 0; i < found.size(); ++i) items.push_back(accepted(expected[i], found[i]));
    return items;
  }
  if (!expected.is_object() || !found.is_object()) return found;
  Json members = Json::object();
  for (const auto& [key, value] : expected.items()) {
    if (found.contains(key)) members[key] = accepted(value, found[key]);
  }
  return members;
}

}  // namespace ax::reader
