#pragma once

#include <optional>
#include <string_view>

namespace ax::reader {

// Seconds since 1970-01-01 00:00 UTC of "2026-03-08T07:15:02.250+01:00". Seconds, their fraction and the
// offset may be missing, blanks around it do not count; without an offset it is in UTC. Empty for anything
// else, such as 30 February.
std::optional<double> parseIsoTime(std::string_view text);

// The offset of such a text in seconds east of UTC; empty for "Z" and for none, which tell no local time.
std::optional<double> offsetOfIsoTime(std::string_view text);

}  // namespace ax::reader
