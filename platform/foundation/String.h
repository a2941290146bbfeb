#pragma once

#include <initializer_list>
#include <string>
#include <string_view>
#include <vector>

#include "platform/runtime/Object.h"

namespace ax {

// An immutable text, UTF-8. Like any object it may carry an accessibility label: the spoken form of an
// abbreviation ("km", spoken "kilometers").
class String : public Object {
 public:
  static Class& staticClass();

  explicit String(std::string text) : text_(std::move(text)) {}

  const std::string& text() const { return text_; }
  bool isEmpty() const { return text_.empty(); }
  bool contains(std::string_view part) const { return text_.find(part) != std::string::npos; }

  bool isEqual(const Object& other) const override;
  std::string description() const override { return text_; }

 private:
  std::string text_;
};

inline Ref<String> string(std::string text) {
  return make<String>(std::move(text));
}
// The one empty String.
Ref<String> emptyString();

// Nil counts as empty.
inline bool isEmpty(const Ref<String>& text) {
  return !text || text->isEmpty();
}

// The text's pieces between newline characters (line feed, carriage return, next line, line and paragraph
// separators); a text without any is one piece.
std::vector<Ref<String>> componentsSeparatedByNewlines(const String& text);

Ref<String> stringByRemoving(const Ref<String>& text, std::string_view part);

}  // namespace ax
