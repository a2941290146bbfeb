#include "reader/scene/JsonNode.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace ax::reader {

namespace {

std::string listed(std::initializer_list<std::string_view> names) {
  std::string text;
  for (std::string_view name : names) text.append(text.empty() ? "" : ", ").append(name);
  return text;
}

}  // namespace

std::string escapedForPointer(std::string_view key) {
  std::string text;
  for (char c : key) {
    if (c == '~' || c == '/') {
      text += c == '~' ? "~0" : "~1";
    } else {
      text += c;
    }
  }
  return text;
}

void JsonNode::fail(std::string what, std::string expected) const {
  throw Fault{*file_, place_, std::move(what), std::move(expected)};
}

void JsonNode::failKind(const std::string& expected) const {
  const bool isShort =
      json_->is_primitive() && json_->dump(-1, ' ', false, Json::error_handler_t::replace).size() <= 40;
  fail(isShort ? json_->dump(-1, ' ', false, Json::error_handler_t::replace)
               : std::string("a value of type ") + json_->type_name(),
       expected);
}

std::string JsonNode::text() const {
  if (!json_->is_string()) failKind("a string");
  return json_->get<std::string>();
}

bool JsonNode::boolean() const {
  if (!json_->is_boolean()) failKind("true or false");
  return json_->get<bool>();
}

std::int64_t JsonNode::integer(std::int64_t least, std::int64_t most) const {
  const bool tooLarge = json_->is_number_unsigned() &&
                        json_->get<std::uint64_t>() > std::uint64_t(std::numeric_limits<std::int64_t>::max());
  const bool fits = json_->is_number_integer() && !tooLarge && json_->get<std::int64_t>() >= least &&
                    json_->get<std::int64_t>() <= most;
  if (!fits) failKind("a whole number from " + std::to_string(least) + " to " + std::to_string(most));
  return json_->get<std::int64_t>();
}

double JsonNode::real() const {
  if (json_->is_number()) return json_->get<double>();
  if (json_->is_string()) {
    const std::string name = json_->get<std::string>();
    if (name == "nan") return std::numeric_limits<double>::quiet_NaN();
    if (name == "inf") return std::numeric_limits<double>::infinity();
    if (name == "-inf") return -std::numeric_limits<double>::infinity();
  }
  failKind("a number, \"nan\", \"inf\" or \"-inf\"");
}

double JsonNode::finiteReal() const {
  if (!json_->is_number()) failKind("a number");
  return json_->get<double>();
}

void JsonNode::expectArray(const std::string& expected) const {
  if (!json_->is_array()) failKind(expected);
}

void JsonNode::expectCount(std::size_t count, const std::string& expected) const {
  expectArray(expected);
  if (json_->size() != count) fail("a list of " + std::to_string(json_->size()), expected);
}

JsonNode JsonNode::child(const Json& json, std::string_view key) const {
  return {json, place_ + "/" + escapedForPointer(key), *file_};
}

JsonNode JsonNode::item(std::size_t index) const {
  return child((*json_)[index], std::to_string(index));
}

JsonNode JsonNode::field(const std::string& key) const {
  if (!json_->is_object()) failKind("an object");
  const auto found = json_->find(key);
  if (found == json_->end()) fail("no \"" + key + "\"", "a value under this key");
  return child(*found, key);
}

std::optional<JsonNode> JsonNode::optionalField(const std::string& key) const {
  if (!has(key)) return std::nullopt;
  return field(key);
}

void JsonNode::expectKeys(std::initializer_list<std::string_view> allowed) const {
  if (!json_->is_object()) failKind("an object with the keys " + listed(allowed));
  for (const auto& [key, value] : json_->items()) {
    if (std::find(allowed.begin(), allowed.end(), key) != allowed.end()) continue;
    child(value, key).fail("unknown key \"" + key + "\"", "one of " + listed(allowed));
  }
}

}  // namespace ax::reader
