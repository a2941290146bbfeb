#include "reader/audit/SpokenChecks.h"

#include <algorithm>
#include <cctype>
#include <regex>

namespace ax::reader {

namespace {

constexpr std::size_t longestSearched = 4000;  // bytes; std::regex recurses with the text

// After a figure, with any blank between, and not within a longer word.
constexpr const char* unitPattern =
    "[0-9](?: |\xC2\xA0|\xE2\x80\xAF)?"
    "(km|kcal|cal|kJ|min|bpm|rpm|mi|m|h|hr|hrs|sec|s|ft|yd|kg|lb|lbs|g|mph|km/h|W|spm|m/s)(?:$|[ ,./)])";

// From one character to another.
struct SymbolRange {
  char32_t first, last;
};

constexpr SymbolRange symbols[] = {{U'#', U'#'},     {U'*', U'*'},     {U'<', U'>'},     {U'^', U'_'},
                                   {U'|', U'|'},     {U'~', U'~'},     {0xB1, 0xB1},     {0xB7, 0xB7},
                                   {0xD7, 0xD7},     {0x2022, 0x2022}, {0x2190, 0x21FF}, {0x2300, 0x23FF},
                                   {0x25A0, 0x27BF}, {0x2B00, 0x2BFF}, {0xFE0F, 0xFE0F}, {0x1F000, 0x1FAFF}};

bool isSymbol(char32_t c) {
  return std::ranges::any_of(symbols, [c](const SymbolRange& r) { return r.first <= c && c <= r.last; });
}

// The character at a place of a well-formed text, and its bytes.
std::pair<char32_t, std::size_t> characterAt(std::string_view text, std::size_t at) {
  const auto byte = [&](std::size_t i) {
    return at + i < text.size() ? static_cast<unsigned char>(text[at + i]) : 0;
  };
  const auto tail = [&](std::size_t i) { return static_cast<char32_t>(byte(i) & 0x3F); };
  const char32_t first = byte(0);
  if (first < 0x80) return {first, 1};
  if (first < 0xE0) return {(first & 0x1F) << 6 | tail(1), 2};
  if (first < 0xF0) return {(first & 0x0F) << 12 | tail(1) << 6 | tail(2), 3};
  return {(first & 0x07) << 18 | tail(1) << 12 | tail(2) << 6 | tail(3), 4};
}

std::string symbolIn(std::string_view text) {
  for (std::size_t i = 0; i < text.size();) {
    const auto [character, length] = characterAt(text, i);
    if (isSymbol(character)) return std::string(text.substr(i, length));
    const bool isSlash = character == U'/' && i > 0 && i + 1 < text.size();
    if (isSlash && std::isdigit(static_cast<unsigned char>(text[i + 1])) != 0) return "/";
    i += length;
  }
  return "";
}

std::string found(const std::string& text, const std::regex& pattern) {
  std::smatch match;
  const std::string head = text.substr(0, longestSearched);
  return std::regex_search(head, match, pattern) ? match[1].str() : "";
}

}  // namespace

std::vector<std::string> piecesOf(std::string_view text, std::string_view separator) {
  std::vector<std::string> pieces;
  const auto add = [&](std::string_view piece) {
    const std::size_t first = piece.find_first_not_of(' ');
    if (first == std::string_view::npos) return;
    pieces.emplace_back(piece.substr(first, piece.find_last_not_of(' ') - first + 1));
  };
  for (std::size_t at; (at = text.find(separator)) != std::string_view::npos;) {
    add(text.substr(0, at));
    text.remove_prefix(at + separator.size());
  }
  add(text);
  return pieces;
}

std::string rawKeyIn(const std::string& text) {
  static const std::regex key("(?:^|[ ,\"])([a-z][a-z0-9-]*(?:\\.[a-z0-9-]+)+)(?:$|[ ,\"])");
  const std::string match = found(text, key);
  return std::ranges::any_of(match, [](unsigned char c) { return std::isalpha(c) != 0; }) ? match : "";
}

std::string abbreviationIn(const std::string& text) {
  static const std::regex unit(unitPattern);
  const std::string abbreviation = found(text, unit);
  return abbreviation.empty() ? symbolIn(text) : abbreviation;
}

bool containsWord(std::string_view text, std::string_view word) {
  const auto isLetter = [&](std::size_t i) {
    const unsigned char c = i < text.size() ? static_cast<unsigned char>(text[i]) : ' ';
    return std::isalpha(c) != 0 || c >= 0x80;
  };
  for (std::size_t at = 0; !word.empty() && (at = text.find(word, at)) != std::string_view::npos; ++at) {
    if ((at == 0 || !isLetter(at - 1)) && !isLetter(at + word.size())) return true;
  }
  return false;
}

// Those of other scripts included: Arabic-Indic and full-width ones.
bool hasDigit(std::string_view text) {
  for (std::size_t i = 0; i < text.size();) {
    const auto [c, length] = characterAt(text, i);
    if ((c >= U'0' && c <= U'9') || (c >= 0x660 && c <= 0x669) || (c >= 0x6F0 && c <= 0x6F9) ||
        (c >= 0xFF10 && c <= 0xFF19)) {
      return true;
    }
    i += length;
  }
  return false;
}

}  // namespace ax::reader
