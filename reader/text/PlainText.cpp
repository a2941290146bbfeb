#include "reader/text/PlainText.h"

#include <algorithm>
#include <cstdint>
#include <cstdio>

namespace ax::reader {

namespace {

constexpr std::size_t longest = 1000;
constexpr std::string_view replacement = "\xEF\xBF\xBD";

struct Character {
  char32_t code = 0;
  std::size_t length = 0;  // in bytes; 0 when they are no UTF-8
};

Character characterAt(std::string_view text) {
  struct Form {
    unsigned char mask, lead;
    char32_t smallest;
  };
  static constexpr Form forms[] = {
      {0x80, 0x00, 0}, {0xE0, 0xC0, 0x80}, {0xF0, 0xE0, 0x800}, {0xF8, 0xF0, 0x10000}};
  const auto byte = [&](std::size_t i) { return static_cast<unsigned char>(text[i]); };
  for (std::size_t more = 0; more < std::size(forms); ++more) {
    const Form& form = forms[more];
    if ((byte(0) & form.mask) != form.lead) continue;
    char32_t code = byte(0) & static_cast<unsigned char>(~form.mask);
    for (std::size_t i = 1; i <= more; ++i) {
      if (i >= text.size() || (byte(i) & 0xC0) != 0x80) return {};
      code = code << 6 | (byte(i) & 0x3F);
    }
    const bool isCharacter = code >= form.smallest && code <= 0x10FFFF && (code < 0xD800 || code > 0xDFFF);
    return isCharacter ? Character{code, more + 1} : Character{};
  }
  return {};
}

struct Range {
  char32_t first, last;
};
// Controls, ends of lines and paragraphs, embeddings and overrides of the direction, isolates.
constexpr Range obeyed[] = {{0, 0x1F}, {0x7F, 0x9F}, {0x2028, 0x202E}, {0x2066, 0x2069}};

bool isObeyed(char32_t code) {
  return std::any_of(std::begin(obeyed), std::end(obeyed),
                     [code](Range range) { return code >= range.first && code <= range.last; });
}

std::string escape(char32_t code) {
  char text[8];
  std::snprintf(text, sizeof text, "\\u%04x", static_cast<unsigned>(code));
  return text;
}

}  // namespace

std::string printable(std::string_view text) {
  std::string line;
  line.reserve(text.size());
  while (!text.empty()) {
    const Character character = characterAt(text);
    if (character.length == 0) {
      line += replacement;
    } else if (isObeyed(character.code)) {
      line += escape(character.code);
    } else {
      line += text.substr(0, character.length);
    }
    text.remove_prefix(std::max<std::size_t>(character.length, 1));
  }
  return line;
}

std::string shortened(std::string_view text) {
  const auto begins = [](char c) { return (static_cast<unsigned char>(c) & 0xC0) != 0x80; };
  const auto characters = static_cast<std::size_t>(std::count_if(text.begin(), text.end(), begins));
  if (characters <= longest) return std::string(text);
  std::size_t end = 0;
  for (std::size_t seen = 0; end < text.size(); ++end) {
    if (begins(text[end]) && seen++ == longest) break;
  }
  return std::string(text.substr(0, end)) + "... (" + std::to_string(characters) + " characters)";
}

}  // namespace ax::reader
