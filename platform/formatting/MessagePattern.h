// Messages with numbered arguments, as the string tables hold them:
//   "{0} of {1}"                                 arguments as they are
//   "{0, plural, one {# day} other {# days}}"    the form that agrees with a number
//   "{0, unit, 1}"                               a number in the unit that argument 1 names, agreeing with it
//   "{0, number, percent}"                       a fraction as whole percent
#pragma once

#include <cstdint>
#include <initializer_list>
#include <span>
#include <string>
#include <string_view>
#include <variant>

#include "platform/formatting/Numbers.h"

namespace ax::formatting {

// The name of a unit, and the pattern that says a number of it: "{0, plural, one {# mile} other {# miles}}".
// A unit with an empty pattern stands behind its number as it is.
struct CountedNoun {
  std::string name;
  std::string pattern;
};

// Numbers are written as the current region writes them, with at most three decimals; one that was written
// before stays as it is and chooses the form of what agrees with it all the same. Text goes in as it is, and
// has no number of its own.
using MessageArgument = std::variant<std::string, std::int64_t, double, NumberText, CountedNoun>;

// The pattern filled in. An argument that the pattern does not use is ignored, and a place without
// an argument stays as "{1}". No value stands for what would agree with it, noun and all, and for the whole
// pattern where that holds no text; an empty text is nothing there; any other text takes the form `other`. A
// pattern that is malformed yields "". Compiled patterns are kept until the region is set. Main thread only.
std::string formatMessage(std::string_view pattern, std::span<const MessageArgument> arguments);

std::string formatMessage(std::string_view pattern, std::initializer_list<MessageArgument> arguments);

// The same; when the text ends with a number, what agrees with the text agrees with that number, and no value
// is no value in the next pattern too.
NumberText filledMessage(std::string_view pattern, std::span<const MessageArgument> arguments);

}  // namespace ax::formatting
