#pragma once

#include <vector>

#include "platform/foundation/String.h"

namespace ax {

// Bytes [location, location + length) of a UTF-8 text, on character boundaries.
struct TextRange {
  std::size_t location = 0;
  std::size_t length = 0;
  bool operator==(const TextRange&) const = default;
};

struct TextAttribute {
  Key key;
  TextRange range;
  Ref<Object> value;
};

// A styled text as the host shows it. Its spoken form, if somebody attached one, is its accessibility label.
class AttributedString : public Object {
 public:
  static Class& staticClass();

  AttributedString() = default;
  explicit AttributedString(Ref<String> string) : string_(std::move(string)) {}

  const Ref<String>& string() const { return string_; }
  void setString(Ref<String> string) { string_ = std::move(string); }
  std::string description() const override { return string_ ? string_->text() : ""; }
  Ref<Object> copy() override { return make<AttributedString>(string_); }

 private:
  Ref<String> string_;
};

// A spoken text with accessibility attributes over ranges of it.
class AccessibilityAttributedString : public String {
 public:
  static Class& staticClass();

  using String::String;
  static Ref<AccessibilityAttributedString> initWithString(const Ref<String>& string);

  void setAttributeForKey(Ref<Object> value, Key key);
  // Ranges that do not lie inside the text are cut to it; empty ones are dropped.
  void setAttributeForKeyWithRange(Ref<Object> value, Key key, TextRange range);
  const std::vector<TextAttribute>& attributes() const { return attributes_; }
  Ref<Object> copy() override;

 private:
  std::vector<TextAttribute> attributes_;
};

// Attribute keys: the range is to be spoken as a duration in minutes and seconds, or in hours, minutes and
// seconds. A plain number under them counts seconds.
extern const Key DurationTimeMMSS;
extern const Key DurationTimeHHMMSS;

}  // namespace ax
