#pragma once

#include <string>
#include <vector>

#include "platform/foundation/AttributedString.h"

namespace ax::reader {

// An attribute that is true over a part of a text.
struct AttributeRange {
  std::string key;
  TextRange range;
};

// A copy of what an object said, with its attributes in the order of their places. An attribute whose value
// is NO or nil is left out.
struct AttributedText {
  std::string text;
  std::vector<AttributeRange> attributes = {};
};

AttributedText attributedText(const String& text);

}  // namespace ax::reader
