#include "platform/formatting/PlatformWords.h"

#include "platform/base/NeverDestroyed.h"
#include "platform/formatting/StringTable.h"

namespace ax::formatting {

std::string platformWord(std::string_view key) {
  static const char inThisModule = 0;
  static NeverDestroyed<StringTable> table(resourceFolderBeside(&inThisModule, "../share/axvelto/Platform"));
  const std::string* text = table->find(key);
  return text == nullptr ? std::string() : *text;
}

}  // namespace ax::formatting
