#pragma once

#include <array>
#include <string_view>

namespace ax {

// The categories in the order in which they are installed. A name without a category installs nothing.
extern const std::array<std::string_view, 65> installationList;

}  // namespace ax
