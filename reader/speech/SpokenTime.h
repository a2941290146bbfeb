#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "reader/text/AttributedText.h"

// How times that stand as digits in a text are spoken. Main thread only.
namespace ax::reader {

// The seconds that "2530", "42:10" or "1:05:30" tell, in the digits of the region or in ASCII ones. A plain
// number counts seconds, the last two of several fields minutes and seconds. Nothing for anything else.
std::optional<double> secondsFromText(std::string_view text);

// The text with every range that is marked as a duration in words. What is no time stays as it is, and so
// does a range that overlaps an earlier one.
std::string withSpokenTimes(const AttributedText& text);
// Empty for nil.
std::string withSpokenTimes(const std::optional<AttributedText>& text);

}  // namespace ax::reader
