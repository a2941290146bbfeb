#pragma once

#include <string>

#include "platform/toolkit/AccessibilityMessages.h"

// What objects answer, as plain text that a failed expectation can print.
namespace ax {

inline std::string plain(const Ref<String>& text) {
  return text ? text->text() : "(none)";
}
inline std::string labelOf(Receiver object) {
  return plain(messages::accessibilityLabel(object));
}
inline std::string valueOf(Receiver object) {
  return plain(messages::accessibilityValue(object));
}
inline std::string hintOf(Receiver object) {
  return plain(messages::accessibilityHint(object));
}

inline void load(Receiver object) {
  messages::_accessibilityLoadAccessibilityInformation(object);
}

// The locales of the six languages, with different digits, groupings and directions.
inline constexpr const char* localesOfAllLanguages[] = {"en_US", "de_DE", "fr_FR", "es_ES", "ja_JP", "ar_EG"};

}  // namespace ax
