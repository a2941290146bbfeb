#include "platform/formatting/Digits.h"

#include <unicode/uchar.h>
#include <unicode/utf8.h>

#include <limits>

namespace ax::formatting {

std::int64_t wholeNumber(std::string_view digits) {
  std::int64_t number = 0;
  const auto length = static_cast<int32_t>(digits.size());
  for (int32_t i = 0; i < length;) {
    UChar32 character = 0;
    U8_NEXT(digits.data(), i, length, character);
    const int32_t digit = u_charDigitValue(character);
    if (digit < 0) continue;
    if (__builtin_mul_overflow(number, 10, &number) || __builtin_add_overflow(number, digit, &number)) {
      return std::numeric_limits<std::int64_t>::max();
    }
  }
  return number;
}

}  // namespace ax::formatting
