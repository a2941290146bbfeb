// How spoken parts are joined.
#pragma once

#include <string_view>

namespace ax::formatting {

// Between two spoken parts in the current language: ", " or that language's own. The text
// lasts until the language changes. Main thread only.
std::string_view listSeparator();

}  // namespace ax::formatting
