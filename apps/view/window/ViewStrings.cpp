#include "apps/view/window/ViewStrings.h"

#include <QGuiApplication>

#include "platform/formatting/StringTable.h"

namespace ax::view {

namespace {

const std::string* find(std::string_view key) {
  static const char inThisProgram = 0;
  static const auto& table =
      *new formatting::StringTable(formatting::resourceFolderBeside(&inThisProgram, "../share/axvelto/View"));
  return table.find(key);
}

}  // namespace

QString viewText(std::string_view key) {
  const std::string* text = find(key);
  return text == nullptr ? QString() : QString::fromStdString(*text);
}

QString viewText(std::string_view key, std::initializer_list<formatting::MessageArgument> arguments) {
  const std::string* pattern = find(key);
  return pattern == nullptr ? QString()
                            : QString::fromStdString(formatting::formatMessage(*pattern, arguments));
}

QString directed(const QString& text) {
  constexpr QChar leftToRight(0x200e), rightToLeft(0x200f);
  return (QGuiApplication::isRightToLeft() ? rightToLeft : leftToRight) + text;
}

}  // namespace ax::view
