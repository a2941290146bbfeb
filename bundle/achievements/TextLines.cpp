#include "bundle/achievements/TextLines.h"

#include "platform/toolkit/SpokenText.h"

namespace ax {

Ref<String> labelForLines(const String& text) {
  const std::vector<Ref<String>> lines = componentsSeparatedByNewlines(text);
  return labelForElements(array({lines.begin(), lines.end()}));
}

}  // namespace ax
