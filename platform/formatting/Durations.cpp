#include "platform/formatting/Durations.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <vector>

#include "platform/formatting/MessagePattern.h"
#include "platform/formatting/PlatformWords.h"

namespace ax::formatting {
namespace {

constexpr double kLongestSeconds = 1e15;

struct Part {
  std::int64_t amount;
  std::string_view key;
};

constexpr std::string_view kMinutes = "quantity.min";

// The parts in words, those that are zero left out.
std::string spoken(std::initializer_list<Part> parts) {
  std::vector<MessageArgument> words;
  for (const Part& part : parts) {
    if (part.amount != 0) words.push_back(formatMessage(platformWord(part.key), {part.amount}));
  }
  if (words.empty()) return formatMessage(platformWord(kMinutes), {std::int64_t{0}});
  if (words.size() == 1) return std::get<std::string>(words.front());
  return formatMessage(platformWord(words.size() == 2 ? "duration.two" : "duration.three"), words);
}

std::string spokenSeconds(std::int64_t seconds) {
  return spoken(
      {{seconds / 3600, "quantity.hr"}, {seconds / 60 % 60, kMinutes}, {seconds % 60, "quantity.s"}});
}

std::int64_t wholeCount(double value, double longest) {
  return std::llround(std::clamp(value, -longest, longest));
}

}  // namespace

std::string spokenDuration(double seconds) {
  return std::isfinite(seconds) ? spokenSeconds(wholeCount(seconds, kLongestSeconds)) : noValueText();
}

std::string spokenMinutes(double seconds) {
  if (!std::isfinite(seconds)) return noValueText();
  const std::int64_t whole = wholeCount(seconds, kLongestSeconds);
  return spoken({{whole / 60, kMinutes}, {whole % 60, "quantity.s"}});
}

std::string spokenHours(double hours) {
  if (!std::isfinite(hours)) return noValueText();
  return spokenSeconds(60 * wholeCount(hours * 60, kLongestSeconds / 60));
}

}  // namespace ax::formatting
