#include "reader/importers/TextEncoding.h"

#include <algorithm>
#include <pugixml.hpp>

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

std::string fromUtf16(std::string_view bytes, bool bigEndian) {
  std::wstring wide;
  for (std::size_t i = 0; i + 1 < bytes.size(); i += 2) {
    const unsigned high = byteAt(bytes, bigEndian ? i : i + 1);
    const unsigned low = byteAt(bytes, bigEndian ? i + 1 : i);
    const auto unit = static_cast<wchar_t>(high << 8 | low);
    const bool completes =
        unit >= 0xDC00 && unit < 0xE000 && !wide.empty() && wide.back() >= 0xD800 && wide.back() < 0xDC00;
    if (completes) {
      wide.back() = ((wide.back() - 0xD800) << 10) + (unit - 0xDC00) + 0x10000;
    } else {
      wide += unit;
    }
  }
  return pugi::as_utf8(wide);
}

std::string fromLatin1(std::string_view bytes) {
  std::string text;
  text.reserve(bytes.size());
  for (std::size_t i = 0; i < bytes.size(); ++i) {
    const unsigned code = byteAt(bytes, i);
    if (code >= 0x80) text += static_cast<char>(0xC0 | code >> 6);
    text += static_cast<char>(code < 0x80 ? code : (0x80 | (code & 0x3F)));
  }
  return text;
}

}  // namespace

bool isUtf8(std::string_view bytes) {
  for (std::size_t i = 0; i < bytes.size();) {
    const std::size_t length = characterLength(bytes, i);
    if (length == 0) return false;
    i += length;
  }
  return true;
}

std::string toUtf8(std::string_view bytes) {
  using namespace std::string_view_literals;
  if (bytes.starts_with("\xFF\xFE")) return fromUtf16(bytes.substr(2), false);
  if (bytes.starts_with("\xFE\xFF")) return fromUtf16(bytes.substr(2), true);
  if (bytes.starts_with("<\0"sv)) return fromUtf16(bytes, false);
  if (bytes.starts_with("\0<"sv)) return fromUtf16(bytes, true);
  std::string text(bytes);
  const std::size_t start = std::min(bytes.find_first_not_of(" \t\r\n"), bytes.size());
  if (bytes.substr(start).starts_with("\xEF\xBB\xBF")) text.erase(start, 3);
  return isUtf8(text) ? text : fromLatin1(text);
}

}  // namespace ax::reader
