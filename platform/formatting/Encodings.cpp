#include "platform/formatting/Encodings.h"

#include <unicode/ucnv.h>

#include <algorithm>
#include <array>
#include <memory>

namespace ax::formatting {

namespace {

using Converter = std::unique_ptr<UConverter, decltype(&ucnv_close)>;

Converter openConverter(const std::string& encoding) {
  UErrorCode status = U_ZERO_ERROR;
  Converter converter(ucnv_open(encoding.c_str(), &status), ucnv_close);
  if (U_FAILURE(status)) converter.reset();
  return converter;
}

}  // namespace

std::optional<std::string> utf8FromEncoding(std::string_view bytes, const std::string& encoding) {
  if (encoding.empty()) return std::nullopt;
  const Converter from = openConverter(encoding);
  const Converter to = openConverter("UTF-8");
  if (!from || !to) return std::nullopt;
  std::string text;
  std::array<char, 4096> part = {};
  std::array<UChar, 1024> pivot = {};
  UChar* pivotStart = pivot.data();
  UChar* pivotEnd = pivot.data();
  const char* at = bytes.data();
  UBool isFirst = true;
  UErrorCode status = U_BUFFER_OVERFLOW_ERROR;
  while (status == U_BUFFER_OVERFLOW_ERROR) {
    status = U_ZERO_ERROR;
    char* end = part.data();
    ucnv_convertEx(to.get(), from.get(), &end, part.data() + part.size(), &at, bytes.data() + bytes.size(),
                   pivot.data(), &pivotStart, &pivotEnd, pivot.data() + pivot.size(), isFirst, true, &status);
    isFirst = false;
    text.append(part.data(), end);
  }
  return text;
}

}  // namespace ax::formatting
