#include "reader/speech/SliceQuantity.h"

#include <algorithm>

#include "platform/formatting/Durations.h"
#include "platform/formatting/Numbers.h"

namespace ax::reader {

namespace {

// The length of the character that begins at `at` if a number may hold it: a digit or, within one, a mark
// that groups digits or begins the decimals.
std::size_t digitAt(std::string_view text, std::size_t at) {
  if (text[at] >= '0' && text[at] <= '9') return 1;
  const std::string_view rest = text.substr(at, 2);
  return rest >= "\u0660" && rest <= "\u0669" ? 2 : 0;
}

std::size_t separatorAt(std::string_view text, std::size_t at) {
  constexpr std::string_view separators[] = {".", ",", "\u066B", "\u066C", "\u00A0", "\u202F", "\u2019"};
  for (const std::string_view separator : separators) {
    if (text.substr(at).starts_with(separator)) return separator.size();
  }
  return 0;
}

std::string_view numberAt(std::string_view text, std::size_t at) {
  std::size_t end = at;
  while (end < text.size()) {
    std::size_t digit = end;
    if (end > at) digit += separatorAt(text, end);
    if (digit >= text.size()) break;
    const std::size_t length = digitAt(text, digit);
    if (length == 0) break;
    end = digit + length;
  }
  return text.substr(at, end - at);
}

std::vector<double> numbersIn(std::string_view text) {
  std::vector<double> numbers;
  for (std::size_t at = 0; at < text.size();) {
    const std::string_view digits = numberAt(text, at);
    if (const auto number = formatting::parseNumber(digits)) numbers.push_back(*number);
    at += std::max<std::size_t>(digits.size(), 1);
  }
  return numbers;
}

// Languages write one and two without digits, so these may stand in any text.
std::optional<double> durationOf(std::string_view text, std::vector<double> numbers) {
  constexpr std::size_t mostUnits = 3;
  if (text.empty() || numbers.size() > mostUnits) return std::nullopt;
  numbers.insert(numbers.end(), {0, 1, 2});
  for (const double hours : numbers) {
    for (const double minutes : numbers) {
      for (const double seconds : numbers) {
        const double all = hours * 60 + minutes + seconds / 60;
        if (formatting::spokenDuration(all * 60) == text) return all;
      }
    }
  }
  return std::nullopt;
}

std::optional<SliceQuantity> rangeIn(const std::vector<double>& numbers) {
  if (numbers.empty()) return std::nullopt;
  const auto [low, high] = std::ranges::minmax(numbers);
  return SliceQuantity{low, high};
}

std::optional<SliceQuantity> exactly(std::optional<double> value) {
  return value ? std::optional(SliceQuantity{*value, *value}) : std::nullopt;
}

}  // namespace

std::vector<std::optional<SliceQuantity>> sliceQuantities(const DataSeries& series) {
  std::vector<std::optional<SliceQuantity>> quantities;
  std::optional<bool> areTimes;  // as the first that tells anything
  for (const DataSlice& slice : series.slices) {
    const std::string text = slice.quantity ? slice.quantity->text : "";
    const std::vector<double> numbers = numbersIn(text);
    if (!areTimes && !text.empty()) areTimes = durationOf(text, numbers).has_value();
    quantities.push_back(areTimes.value_or(false) ? exactly(durationOf(text, numbers)) : rangeIn(numbers));
  }
  return quantities;
}

}  // namespace ax::reader
