// How spoken parts are joined.
#pragma once

#include <string_view>

namespace ax::formatting {

// Between two spoken parts in the current language: ", " or that language's own. Main thread only;
// the text itself lasts for ever.
std::string_view listSeparator();

}  // namespace ax::formatting
