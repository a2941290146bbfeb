#pragma once

#include <concepts>
#include <initializer_list>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace ax::reader {

// An attribute of an element. One without a value is left out.
struct Attribute {
  Attribute(std::string_view attribute, std::string_view text) : name(attribute), value(text) {}
  Attribute(std::string_view attribute, const char* text) : name(attribute), value(text) {}
  Attribute(std::string_view attribute, std::string text) : name(attribute), value(std::move(text)) {}
  Attribute(std::string_view attribute, std::optional<std::string> text)
      : name(attribute), value(std::move(text)) {}
  // In plain digits, at most two decimals.
  Attribute(std::string_view attribute, double number);
  // True is an attribute without a text, false none.
  Attribute(std::string_view attribute, std::same_as<bool> auto isSet)
      : name(attribute), value(isSet ? std::optional(std::string()) : std::nullopt) {}

  std::string_view name;
  std::optional<std::string> value;
};

// A number as markup writes it: "12.5", with at most two decimals; what is no number is 0.
std::string markupNumber(double value);

// Builds a document that is good HTML and, as far as its elements are, good XML. Texts and values may hold
// anything: what would end them is escaped, bytes that are no UTF-8 become U+FFFD, and control characters
// are left out.
class Markup {
 public:
  using Attributes = std::initializer_list<Attribute>;

  Markup& open(std::string_view name, Attributes attributes = {});
  Markup& close();                                                   // the element opened last
  Markup& empty(std::string_view name, Attributes attributes = {});  // an element that holds nothing
  Markup& text(std::string_view text);
  Markup& raw(std::string_view markup);  // as it stands
  // An element that holds a text alone.
  Markup& element(std::string_view name, Attributes attributes, std::string_view content);

  const std::string& str() const { return text_; }
  std::string take() { return std::move(text_); }

 private:
  void start(std::string_view name, Attributes attributes);

  std::string text_;
  std::vector<std::string> open_;
};

}  // namespace ax::reader
