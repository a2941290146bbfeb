#include "reader/importers/TextEncoding.h"

#include <algorithm>
#include <cctype>
#include <optional>

#include "platform/formatting/Encodings.h"

namespace ax::reader {
namespace {

unsigned byteAt(std::string_view bytes, std::size_t index) {
  return static_cast<unsigned char>(bytes[index]);
}

// How many bytes the character at `index` takes; 0 when it is not well-formed.
std::size_t characterLength(std::string_view bytes, std::size_t index) {
  const unsigned lead = byteAt(bytes, index);
  if (lead < 0x80) return 1;
  if (lead < 0xC2 || lead > 0xF4) return 0;
  const std::size_t length = lead < 0xE0 ? 2 : lead < 0xF0 ? 3 : 4;
  if (bytes.size() - index < length) return 0;
  // Leads whose second byte would make an overlong form, a surrogate or something beyond U+10FFFF.
  const unsigned least = lead == 0xE0 ? 0xA0 : lead == 0xF0 ? 0x90 : 0x80;
  const unsigned most = lead == 0xED ? 0x9F : lead == 0xF4 ? 0x8F : 0xBF;
  if (byteAt(bytes, index + 1) < least || byteAt(bytes, index + 1) > most) return 0;
  for (std::size_t i = 2; i < length; ++i) {
    if ((byteAt(bytes, index + i) & 0xC0) != 0x80) return 0;
  }
  return length;
}

bool hasCharacterBeyondAscii(std::string_view bytes) {
  for (std::size_t i = 0; i < bytes.size(); ++i) {
    if (byteAt(bytes, i) >= 0x80 && characterLength(bytes, i) > 0) return true;
  }
  return false;
}

// The name in <?xml version="1.0" encoding="KOI8-R"?>.
std::string declaredEncoding(std::string_view text) {
  if (!text.starts_with("<?xml")) return {};
  const std::string_view declaration = text.substr(0, text.find("?>"));
  const std::size_t key = declaration.find("encoding");
  if (key == std::string_view::npos) return {};
  const std::size_t quote = declaration.find_first_of("\"'", key);
  if (quote == std::string_view::npos) return {};
  const std::string_view rest = declaration.substr(quote + 1);
  return std::string(rest.substr(0, rest.find(declaration[quote])));
}

// UTF-16 is none where its bytes have not shown it.
bool isUtf8Name(std::string name) {
  std::ranges::transform(name, name.begin(),
                         [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
  return name == "utf-8" || name == "utf8" || name == "us-ascii" || name.starts_with("utf-16");
}

// UTF-16 without any doubt, from the first two bytes.
struct WideStart {
  std::string_view start;
  const char* encoding;
  bool isMark;
};
constexpr std::string_view openLittle("<\0", 2), openBig("\0<", 2);
constexpr WideStart wideStarts[] = {{"\xFF\xFE", "UTF-16LE", true},
                                    {"\xFE\xFF", "UTF-16BE", true},
                                    {openLittle, "UTF-16LE", false},
                                    {openBig, "UTF-16BE", false}};

}  // namespace

bool isUtf8(std::string_view bytes) {
  for (std::size_t i = 0; i < bytes.size();) {
    const std::size_t length = characterLength(bytes, i);
    if (length == 0) return false;
    i += length;
  }
  return true;
}

std::string_view toUtf8(std::string_view bytes, std::string& kept) {
  for (const auto& [start, encoding, isMark] : wideStarts) {
    if (!bytes.starts_with(start)) continue;
    kept = formatting::utf8FromEncoding(bytes.substr(isMark ? start.size() : 0), encoding).value_or("");
    return kept;
  }
  const std::size_t start = std::min(bytes.find_first_not_of(" \t\r\n"), bytes.size());
  const bool isMarked = bytes.substr(start).starts_with("\xEF\xBB\xBF");
  if (isMarked && start == 0) bytes.remove_prefix(3);
  if (isMarked && start != 0) {
    kept = std::string(bytes).erase(start, 3);
    bytes = kept;
  }
  const std::string declared = isMarked ? "" : declaredEncoding(bytes.substr(start));
  const bool isOwn = declared.empty() || isUtf8Name(declared);
  if (isOwn && isUtf8(bytes)) return bytes;
  const bool isOther = declared.empty() && !isMarked && !hasCharacterBeyondAscii(bytes);
  auto text = formatting::utf8FromEncoding(bytes, isOther ? "windows-1252" : isOwn ? "UTF-8" : declared);
  if (!text) text = formatting::utf8FromEncoding(bytes, "UTF-8");
  kept = std::move(text).value_or("");
  return kept;
}

}  // namespace ax::reader
