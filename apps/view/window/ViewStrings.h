#pragma once

#include <QString>
#include <initializer_list>
#include <string_view>

#include "platform/formatting/MessagePattern.h"

// The window's own words, in the language of the environment. Main thread only.
namespace ax::view {

// The text of a key, or its pattern filled in; empty for a key that there is not.
QString viewText(std::string_view key);
QString viewText(std::string_view key, std::initializer_list<formatting::MessageArgument> arguments);

// A text that is shown in the direction of the language, whatever script it begins with.
QString directed(const QString& text);

}  // namespace ax::view
