#include "platform/formatting/Text.h"

#include <unicode/locid.h>
#include <unicode/unistr.h>
#include <unicode/ustring.h>

#include "platform/formatting/Region.h"

namespace ax::formatting {

std::string utf8From(std::u16string_view text) {
  std::string result(text.size() * 3, '\0');
  int32_t length = 0;
  UErrorCode status = U_ZERO_ERROR;
  u_strToUTF8WithSub(result.data(), static_cast<int32_t>(result.size()), &length, text.data(),
                     static_cast<int32_t>(text.size()), 0xFFFD, nullptr, &status);
  result.resize(U_SUCCESS(status) ? static_cast<std::size_t>(length) : 0);
  return result;
}

std::u16string utf16From(std::string_view text) {
  std::u16string result(text.size(), u'\0');
  int32_t length = 0;
  UErrorCode status = U_ZERO_ERROR;
  u_strFromUTF8WithSub(result.data(), static_cast<int32_t>(result.size()), &length, text.data(),
                       static_cast<int32_t>(text.size()), 0xFFFD, nullptr, &status);
  result.resize(U_SUCCESS(status) ? static_cast<std::size_t>(length) : 0);
  return result;
}

std::string gregorianLocaleName() {
  icu::Locale locale(currentRegion().locale.c_str());
  UErrorCode status = U_ZERO_ERROR;
  locale.setKeywordValue("calendar", "gregorian", status);
  return locale.getName();
}

}  // namespace ax::formatting
