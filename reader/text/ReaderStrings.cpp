#include "reader/text/ReaderStrings.h"

#include "platform/base/NeverDestroyed.h"
#include "platform/formatting/Lists.h"
#include "platform/formatting/StringTable.h"

namespace ax::reader {

namespace {

const std::string* find(std::string_view key) {
  static const char inThisProgram = 0;
  static NeverDestroyed<formatting::StringTable> table(
      formatting::resourceFolderBeside(&inThisProgram, "../share/axvelto/Reader"));
  return table->find(key);
}

}  // namespace

std::string readerText(std::string_view key) {
  const std::string* text = find(key);
  return text == nullptr ? std::string() : *text;
}

std::string readerText(std::string_view key, std::initializer_list<formatting::MessageArgument> arguments) {
  const std::string* pattern = find(key);
  return pattern == nullptr ? std::string() : formatting::formatMessage(*pattern, arguments);
}

std::string joined(const std::vector<std::string>& parts) {
  std::string all;
  for (const std::string& part : parts) {
    if (part.empty()) continue;
    if (!all.empty()) all += formatting::listSeparator();
    all += part;
  }
  return all;
}

}  // namespace ax::reader
