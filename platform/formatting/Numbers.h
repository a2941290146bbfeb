// Numbers as the current region writes them, with U+2212 as minus, which speech says as a word. What is no
// number, or has no end, is written as the platform's word for no value. Everything rounds half away from
// zero, and nothing is ever "−0". Main thread only. Nothing here fails, except parsing.
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace ax::formatting {

struct PluralOperands;  // internal to this folder

// A number that was written, and what its text says of plural forms: a noun beside it agrees with the number
// as it stands there, rounded, with the decimals that are to be seen. Copies share what they know.
struct NumberText {
  std::string text;
  std::shared_ptr<const PluralOperands> operands;  // null for no value, and for a text that ends otherwise
  // Whether the text is this number and nothing else; "349 of 500" only ends with its number.
  bool isAlone = true;
  // Whether the text is the word for no value and nothing else.
  bool isNoValue = false;
};

NumberText decimalNumber(double value, int maximumFractionDigits);
NumberText integerNumber(std::int64_t value);
NumberText percentNumber(double fraction);

// The texts alone. At most `maximumFractionDigits` decimals (0 to 15, clamped), without trailing zeros,
// grouped.
std::string decimalString(double value, int maximumFractionDigits);

// Grouped: "1,234".
std::string integerString(std::int64_t value);

// The same without grouping: "1234", in the region's digits.
std::string plainIntegerString(std::int64_t value);

// Whole percent of a fraction: 1.0 gives "100%".
std::string percentString(double fraction);

// The platform's word for no value, in the current region's language.
std::string noValueText();

enum class PluralForm : std::uint8_t { zero, one, two, few, many, other };

// The form that the current region's language wants beside a number; `other` for no value.
PluralForm pluralForm(const NumberText& number);

bool isNegative(const NumberText& number);

// The number that the whole of `text` is, in the region's notation; ASCII digits always count as
// digits. Groups must be whole: "12,34" is nothing in English. Nothing for a number without end.
std::optional<double> parseNumber(std::string_view text);

}  // namespace ax::formatting
