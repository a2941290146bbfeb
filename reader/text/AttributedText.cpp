#include "reader/text/AttributedText.h"

#include <algorithm>

#include "platform/runtime/Boxing.h"

namespace ax::reader {

AttributedText attributedText(const String& text) {
  AttributedText copy{text.text()};
  const auto* attributed = cast<AccessibilityAttributedString>(&text);
  if (attributed == nullptr) return copy;
  for (const TextAttribute& attribute : attributed->attributes()) {
    if (!unbox<bool>(attribute.value)) continue;
    copy.attributes.push_back({std::string(attribute.key.name()), attribute.range});
  }
  std::ranges::stable_sort(copy.attributes, {}, [](const AttributeRange& a) { return a.range.location; });
  return copy;
}

}  // namespace ax::reader
