#include "reader/sound/SliceValues.h"

#include <algorithm>
#include <map>
#include <string>
#include <string_view>

#include "platform/formatting/Durations.h"
#include "platform/formatting/Numbers.h"

namespace ax::reader {

namespace {

using Durations = std::map<std::string, int, std::less<>>;

constexpr int minutesPerDay = 24 * 60;
constexpr std::size_t longestFigure = 32;  // bytes: digits of other scripts take up to four

// Languages tell an hour or two without a figure, so what is told is looked up whole.
Durations spokenMinutes() {
  Durations durations;
  for (int minutes = 0; minutes <= minutesPerDay; ++minutes) {
    durations.emplace(formatting::spokenDuration(60.0 * minutes), minutes);
  }
  return durations;
}

std::size_t endOfCharacter(std::string_view text, std::size_t at) {
  for (++at; at < text.size() && (text[at] & 0xC0) == 0x80;) ++at;
  return at;
}

struct Figure {
  double value;
  std::size_t end;
};

// The longest that begins with the digit at a place; nothing where there is no digit.
std::optional<Figure> figureAt(std::string_view text, std::size_t at) {
  std::optional<Figure> found;
  const std::size_t last = std::min(text.size(), at + longestFigure);
  for (std::size_t end = endOfCharacter(text, at); end <= last; end = endOfCharacter(text, end)) {
    const std::optional<double> value = formatting::parseNumber(text.substr(at, end - at));
    if (value) found = {*value, end};
    if (!found || end == text.size()) break;
  }
  return found;
}

std::optional<ValueRange> figuresIn(std::string_view text) {
  std::optional<ValueRange> range;
  for (std::size_t i = 0; i < text.size();) {
    const std::optional<Figure> figure = figureAt(text, i);
    i = figure ? figure->end : endOfCharacter(text, i);
    if (!figure) continue;
    if (!range) range = {figure->value, figure->value};
    range = {std::min(range->low, figure->value), std::max(range->high, figure->value)};
  }
  return range;
}

std::optional<ValueRange> valuesIn(const std::optional<AttributedText>& quantity,
                                   const Durations& durations) {
  if (!quantity) return std::nullopt;
  const auto duration = durations.find(quantity->text);
  if (duration == durations.end()) return figuresIn(quantity->text);
  return ValueRange{double(duration->second), double(duration->second)};
}

}  // namespace

std::vector<std::optional<ValueRange>> sliceValues(const DataSeries& series) {
  const Durations durations = spokenMinutes();
  std::vector<std::optional<ValueRange>> values;
  for (const DataSlice& slice : series.slices) values.push_back(valuesIn(slice.quantity, durations));
  return values;
}

}  // namespace ax::reader
