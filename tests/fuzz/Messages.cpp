#include <array>
#include <limits>

#include "platform/formatting/MessagePattern.h"
#include "tests/fuzz/Pieces.h"

// The first line is the pattern, the rest its text and the pattern of its noun.
void ax::fuzz::fuzzMessages(Bytes bytes) {
  using formatting::CountedNoun;
  using formatting::MessageArgument;
  const std::string text = textOf(bytes);
  const auto [pattern, rest] = firstLine(text);
  const std::string word(rest);
  const std::array<MessageArgument, 4> arguments = {CountedNoun{"mile", word}, std::int64_t{2}, word, 0.5};
  const std::array<MessageArgument, 2> extremes = {std::numeric_limits<double>::quiet_NaN(),
                                                   std::numeric_limits<std::int64_t>::min()};
  formatting::formatMessage(pattern, arguments);
  formatting::formatMessage(pattern, extremes);
  formatting::filledMessage(pattern, std::span(arguments).last(3));
}
