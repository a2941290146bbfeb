#include "platform/foundation/String.h"

#include <array>

#include "platform/base/NeverDestroyed.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/KeyReading.h"

namespace ax {

Class& String::staticClass() {
  static Class& result = ClassBuilder<String>("String", Object::staticClass()).build();
  return result;
}

bool String::isEqual(const Object& other) const {
  const String* text = cast<String>(&other);
  return text != nullptr && text->text_ == text_;
}

Ref<String> emptyString() {
  static NeverDestroyed<Ref<String>> empty(string(""));
  return *empty;
}

std::vector<Ref<String>> componentsSeparatedByNewlines(const String& text) {
  static constexpr std::array<std::string_view, 7> newlines = {
      "\n", "\r", "\v", "\f", "\xC2\x85", "\xE2\x80\xA8", "\xE2\x80\xA9"};
  std::vector<Ref<String>> pieces;
  const std::string_view all = text.text();
  std::size_t start = 0;
  for (std::size_t i = 0; i < all.size();) {
    std::size_t length = 0;
    for (std::string_view newline : newlines) {
      if (all.substr(i).starts_with(newline)) length = newline.size();
    }
    if (length == 0) {
      ++i;
      continue;
    }
    pieces.push_back(string(std::string(all.substr(start, i - start))));
    start = i += length;
  }
  pieces.push_back(string(std::string(all.substr(start))));
  return pieces;
}

Ref<String> stringByRemoving(const Ref<String>& text, std::string_view part) {
  if (!text || !text->contains(part)) return text;
  std::string_view rest = text->text();
  std::string kept;
  for (std::size_t at = rest.find(part); at != std::string_view::npos; at = rest.find(part)) {
    kept += rest.substr(0, at);
    rest.remove_prefix(at + part.size());
  }
  return string(kept.append(rest));
}

Ref<String> safeStringForKey(Receiver receiver, Key key) {
  return cast<String>(safeValueForKey(receiver, key));
}

static const RegisteredClass<String> registered;

}  // namespace ax
