// Messages with numbered arguments, as the string tables hold them: "{0} of {1}", or with plural forms
// "{0, plural, one {# day} other {# days}}".
#pragma once

#include <cstdint>
#include <initializer_list>
#include <span>
#include <string>
#include <string_view>
#include <variant>

namespace ax::formatting {

// Numbers choose plural forms and are written as the current region writes them, with at most three
// decimals; text goes in as it is.
using MessageArgument = std::variant<std::string, std::int64_t, double>;

// The pattern filled in. An argument that the pattern does not use is ignored, and a place without
// an argument stays as "{1}". A pattern that is malformed, or that wants a number where text is
// given, yields "". Compiled patterns are kept until the region is set. Main thread only.
std::string formatMessage(std::string_view pattern, std::span<const MessageArgument> arguments);

std::string formatMessage(std::string_view pattern, std::initializer_list<MessageArgument> arguments);

}  // namespace ax::formatting
