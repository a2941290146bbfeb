#pragma once

#include <initializer_list>
#include <string>
#include <string_view>
#include <vector>

#include "platform/formatting/MessagePattern.h"

// The reader's own words, in the language of the environment. Main thread only.
namespace ax::reader {

// The text of a key, or its pattern filled in; empty for a key that there is not.
std::string readerText(std::string_view key);
std::string readerText(std::string_view key, std::initializer_list<formatting::MessageArgument> arguments);

// Parts joined as the language joins spoken parts; empty ones drop out with their separators.
std::string joined(const std::vector<std::string>& parts);

}  // namespace ax::reader
