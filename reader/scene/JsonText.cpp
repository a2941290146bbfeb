#include "reader/scene/JsonText.h"

#include <algorithm>
#include <optional>
#include <unordered_set>

namespace ax::reader {

namespace {

constexpr std::size_t deepest = 100;

// Builds the document while it is read. The stack holds the open arrays and objects; only the innermost one
// grows, so that the pointers stay good.
class DocumentBuilder final : public nlohmann::json_sax<Json> {
 public:
  bool null() override { return add(nullptr); }
  bool boolean(bool value) override { return add(value); }
  bool number_integer(number_integer_t value) override { return add(value); }
  bool number_unsigned(number_unsigned_t value) override { return add(value); }
  bool number_float(number_float_t value, const string_t&) override { return add(value); }
  bool string(string_t& value) override { return add(std::move(value)); }
  bool binary(binary_t&) override { return false; }
  bool start_object(std::size_t) override { return open(Json::object()); }
  bool start_array(std::size_t) override { return open(Json::array()); }
  bool end_object() override { return close(); }
  bool end_array() override { return close(); }
  bool key(string_t& name) override;
  bool parse_error(std::size_t position, const std::string&, const Json::exception& error) override;

  Json document;
  std::string what;  // empty: nothing is wrong so far
  std::string expected;
  std::optional<std::size_t> position;  // in bytes, from 1

 private:
  bool add(Json value) {
    place() = std::move(value);
    return true;
  }
  bool open(Json value);
  bool close() {
    open_.pop_back();
    keys_.pop_back();
    return true;
  }
  Json& place();

  std::vector<Json*> open_;
  std::vector<std::unordered_set<std::string>> keys_;  // of each; an ordered object looks them up one by one
  std::string key_;
};

Json& DocumentBuilder::place() {
  if (open_.empty()) return document;
  Json& parent = *open_.back();
  if (parent.is_object()) {
    return parent.get_ref<Json::object_t&>().emplace_back(std::move(key_), nullptr).second;
  }
  parent.push_back(nullptr);
  return parent.back();
}

bool DocumentBuilder::open(Json value) {
  if (open_.size() == deepest) {
    what = "values nested too deep";
    expected = "at most " + std::to_string(deepest) + " levels";
    return false;
  }
  Json& opened = place();
  opened = std::move(value);
  open_.push_back(&opened);
  keys_.emplace_back();
  return true;
}

bool DocumentBuilder::key(string_t& name) {
  key_ = std::move(name);
  if (keys_.back().insert(key_).second) return true;
  what = "the key \"" + key_ + "\" twice in one object";
  expected = "it once";
  return false;
}

// The library's own wording, without its numbers and its place.
std::string plainReason(std::string text) {
  const std::size_t bracket = text.find("] ");
  if (bracket != std::string::npos) text.erase(0, bracket + 2);
  const std::size_t colon = text.find(": ");
  if (text.starts_with("parse error") && colon != std::string::npos) text.erase(0, colon + 2);
  return text;
}

bool DocumentBuilder::parse_error(std::size_t at, const std::string&, const Json::exception& error) {
  what = plainReason(error.what());
  const std::size_t wanted = what.find("; expected ");
  if (wanted != std::string::npos) {
    expected = what.substr(wanted + 11);
    what.erase(wanted);
  } else {
    expected = "valid JSON";
  }
  position = at;
  return false;
}

// Columns count characters. The position is that of the last byte that was read.
std::string lineAndColumn(std::string_view text, std::size_t position) {
  const std::string_view read = text.substr(0, std::min(position == 0 ? 0 : position - 1, text.size()));
  const auto line = 1 + std::count(read.begin(), read.end(), '\n');
  const std::size_t newline = read.rfind('\n');
  const std::string_view inLine = read.substr(newline == std::string_view::npos ? 0 : newline + 1);
  const auto column = 1 + std::count_if(inLine.begin(), inLine.end(), [](char c) {
                        return (static_cast<unsigned char>(c) & 0xC0) != 0x80;
                      });
  return "line " + std::to_string(line) + ", column " + std::to_string(column);
}

// Hands out a text and knows how much of it has been taken.
class CountingIterator {
 public:
  using difference_type = std::ptrdiff_t;
  using value_type = char;
  using pointer = const char*;
  using reference = const char&;
  using iterator_category = std::input_iterator_tag;

  CountingIterator(const char* at, std::size_t* taken) : at_(at), taken_(taken) {}
  reference operator*() const { return *at_; }
  CountingIterator& operator++() {
    ++at_;
    ++*taken_;
    return *this;
  }
  bool operator==(const CountingIterator& other) const { return at_ == other.at_; }
  bool operator!=(const CountingIterator& other) const { return at_ != other.at_; }

 private:
  const char* at_;
  std::size_t* taken_;
};

}  // namespace

Json readJson(std::string_view text, const std::string& file) {
  // The parser would take a zero byte for the end.
  if (const std::size_t zero = text.find('\0'); zero != std::string_view::npos) {
    throw Fault{file, lineAndColumn(text, zero + 1), "a zero byte", "valid JSON"};
  }
  DocumentBuilder builder;
  std::size_t taken = 0;
  const CountingIterator begin(text.data(), &taken);
  const CountingIterator end(text.data() + text.size(), &taken);
  if (Json::sax_parse(begin, end, &builder)) return std::move(builder.document);
  throw Fault{file, lineAndColumn(text, builder.position.value_or(taken)), builder.what, builder.expected};
}

}  // namespace ax::reader
