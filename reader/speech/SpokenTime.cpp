#include "reader/speech/SpokenTime.h"

#include <cmath>

#include "platform/formatting/Durations.h"
#include "platform/formatting/Numbers.h"

namespace ax::reader {

namespace {

constexpr std::string_view directionMarks[] = {"\u200e", "\u200f", "\u061c"};

std::string withoutDirectionMarks(std::string text) {
  for (const std::string_view mark : directionMarks) {
    for (std::size_t at; (at = text.find(mark)) != std::string::npos;) text.erase(at, mark.size());
  }
  return text;
}

std::string_view trimmed(std::string_view text) {
  const std::size_t first = text.find_first_not_of(" \t\n");
  if (first == std::string_view::npos) return {};
  return text.substr(first, text.find_last_not_of(" \t\n") - first + 1);
}

// Fields after the first are minutes or seconds, and so below 60; only the last may have a fraction.
bool isField(double value, bool isFirst, bool isLast) {
  return std::isfinite(value) && value >= 0 && (isFirst || value < 60) &&
         (isLast || value == std::floor(value));
}

std::optional<std::string> spokenTime(std::string_view key, std::string_view text) {
  const bool isMinutesAndSeconds = key == DurationTimeMMSS.name();
  if (!isMinutesAndSeconds && key != DurationTimeHHMMSS.name()) return std::nullopt;
  const std::optional<double> seconds = secondsFromText(text);
  if (!seconds) return std::nullopt;
  return isMinutesAndSeconds ? formatting::spokenMinutes(*seconds) : formatting::spokenDuration(*seconds);
}

}  // namespace

std::optional<double> secondsFromText(std::string_view text) {
  const std::string cleaned = withoutDirectionMarks(std::string(text));
  std::string_view rest = cleaned;
  double total = 0;
  for (int fields = 1; fields <= 3; ++fields) {
    const std::size_t end = rest.find(':');
    const bool isLast = end == std::string_view::npos;
    const std::optional<double> field = formatting::parseNumber(trimmed(rest.substr(0, end)));
    if (!field || !isField(*field, fields == 1, isLast)) return std::nullopt;
    total = total * 60 + *field;
    if (isLast) return total;
    rest.remove_prefix(end + 1);
  }
  return std::nullopt;
}

std::string withSpokenTimes(const AttributedText& text) {
  std::string spoken;
  std::size_t done = 0;
  for (const AttributeRange& attribute : text.attributes) {
    const auto [start, length] = attribute.range;
    if (start < done || start + length > text.text.size()) continue;
    const auto words = spokenTime(attribute.key, std::string_view(text.text).substr(start, length));
    if (!words) continue;
    spoken += text.text.substr(done, start - done) + *words;
    done = start + length;
  }
  return spoken + text.text.substr(done);
}

std::string withSpokenTimes(const std::optional<AttributedText>& text) {
  return text ? withSpokenTimes(*text) : std::string();
}

}  // namespace ax::reader
