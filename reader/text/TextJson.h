#pragma once

#include <nlohmann/json.hpp>
#include <optional>

#include "platform/runtime/Geometry.h"
#include "reader/text/AttributedText.h"

namespace ax::reader {

// A text, or null; one with attributes as {"string", "attributes": [{"key", "range"}]}.
nlohmann::ordered_json textAsJson(const std::optional<AttributedText>& text);
// [x, y, width, height]
nlohmann::ordered_json rectAsJson(const Rect& rect);

}  // namespace ax::reader
