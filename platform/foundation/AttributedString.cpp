#include "platform/foundation/AttributedString.h"

#include <algorithm>

#include "platform/runtime/ClassBuilder.h"

namespace ax {

const Key DurationTimeMMSS = Selector::intern("DurationTimeMMSS");
const Key DurationTimeHHMMSS = Selector::intern("DurationTimeHHMMSS");

Class& AttributedString::staticClass() {
  static Class& result = ClassBuilder<AttributedString>("AttributedString", Object::staticClass())
                             .property<&AttributedString::string, &AttributedString::setString>("string")
                             .build();
  return result;
}

Class& AccessibilityAttributedString::staticClass() {
  static Class& result =
      ClassBuilder<AccessibilityAttributedString>("AccessibilityAttributedString", String::staticClass())
          .build();
  return result;
}

Ref<AccessibilityAttributedString> AccessibilityAttributedString::initWithString(const Ref<String>& string) {
  return make<AccessibilityAttributedString>(string ? string->text() : "");
}

Ref<Object> AccessibilityAttributedString::copy() {
  Ref<AccessibilityAttributedString> result = make<AccessibilityAttributedString>(text());
  result->attributes_ = attributes_;
  return result;
}

void AccessibilityAttributedString::setAttributeForKey(Ref<Object> value, Key key) {
  setAttributeForKeyWithRange(std::move(value), key, {0, text().size()});
}

void AccessibilityAttributedString::setAttributeForKeyWithRange(Ref<Object> value, Key key, TextRange range) {
  const std::size_t start = std::min(range.location, text().size());
  const std::size_t length = std::min(range.length, text().size() - start);
  if (length != 0) attributes_.push_back({key, {start, length}, std::move(value)});
}

static const RegisteredClass<AttributedString> registered;
static const RegisteredClass<AccessibilityAttributedString> registeredSpoken;

}  // namespace ax
