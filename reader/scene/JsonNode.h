#pragma once

#include <cstdint>
#include <initializer_list>
#include <optional>
#include <string>
#include <string_view>

#include "reader/scene/JsonText.h"

namespace ax::reader {

// A key as a JSON pointer writes it.
std::string escapedForPointer(std::string_view key);

// A value of a JSON document and where it stands. What it is asked for and is not, it throws as a Fault. It
// refers to the document and to the file's name.
class JsonNode {
 public:
  JsonNode(const Json& json, std::string place, const std::string& file)
      : json_(&json), place_(std::move(place)), file_(&file) {}

  const Json& json() const { return *json_; }
  const std::string& place() const { return place_; }
  const std::string& file() const { return *file_; }

  [[noreturn]] void fail(std::string what, std::string expected) const;
  // The same, about the kind of value that stands here.
  [[noreturn]] void failKind(const std::string& expected) const;

  std::string text() const;
  bool boolean() const;
  std::int64_t integer(std::int64_t least, std::int64_t most) const;
  // Also "nan", "inf" and "-inf".
  double real() const;
  double finiteReal() const;

  bool isObject() const { return json_->is_object(); }
  bool isArray() const { return json_->is_array(); }
  std::size_t size() const { return json_->size(); }
  // Of an array.
  void expectArray(const std::string& expected) const;
  void expectCount(std::size_t count, const std::string& expected) const;
  JsonNode item(std::size_t index) const;
  // Of an object.
  JsonNode field(const std::string& key) const;
  std::optional<JsonNode> optionalField(const std::string& key) const;
  // Faults when this is no object, or one with other keys.
  void expectKeys(std::initializer_list<std::string_view> allowed) const;
  bool has(const std::string& key) const { return json_->contains(key); }

  template <class Visit>
  void forEachItem(Visit visit) const {
    for (std::size_t i = 0; i < json_->size(); ++i) visit(item(i));
  }
  template <class Visit>
  void forEachField(Visit visit) const {
    for (const auto& [key, value] : json_->items()) visit(key, child(value, key));
  }

 private:
  JsonNode child(const Json& json, std::string_view key) const;

  const Json* json_;
  std::string place_;
  const std::string* file_;
};

}  // namespace ax::reader
