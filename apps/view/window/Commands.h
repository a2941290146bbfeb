#pragma once

#include <QString>
#include <vector>

namespace ax::view {

class ViewWindow;

// Something a person can do, by a key or from a menu.
struct Command {
  const char* menu;  // keys of texts
  const char* text;
  const char* keys;  // as QKeySequence reads them, separated by blanks
  void (*run)(ViewWindow& window, int with);
  int with = 0;
};

// In the order of the menus.
const std::vector<Command>& commands();
// In the language of the environment.
QString commandText(const Command& command);

}  // namespace ax::view
