#include "reader/text/TextJson.h"

namespace ax::reader {

using Json = nlohmann::ordered_json;

Json textAsJson(const std::optional<AttributedText>& text) {
  if (!text) return nullptr;
  if (text->attributes.empty()) return text->text;
  Json attributes = Json::array();
  for (const auto& [key, range] : text->attributes) {
    attributes.push_back({{"key", key}, {"range", {range.location, range.length}}});
  }
  return {{"string", text->text}, {"attributes", attributes}};
}

Json rectAsJson(const Rect& rect) {
  return {rect.x, rect.y, rect.width, rect.height};
}

}  // namespace ax::reader
