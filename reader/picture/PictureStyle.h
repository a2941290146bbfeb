#pragma once

#include <string_view>

#include "platform/runtime/Geometry.h"
#include "reader/picture/Markup.h"

namespace ax::reader {

// The colours of a picture on white. Every one of them stands out from its ground by 4.5 to 1 or more where
// it carries text, by 3 to 1 where it is a line.
namespace colours {
inline constexpr const char* ground = "#ffffff";
inline constexpr const char* ink = "#1d2430";
inline constexpr const char* outline = "#66717f";
inline constexpr const char* fill = "#f1f4f8";
inline constexpr const char* control = "#dde9fb";
inline constexpr const char* data = "#2f6fb2";
}  // namespace colours

// Opens an SVG document of this size that is read as one picture.
void openPicture(Markup& svg, const Rect& area, const std::string& name);

}  // namespace ax::reader
