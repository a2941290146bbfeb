#include "apps/view/window/Commands.h"

#include "apps/view/window/ViewStrings.h"
#include "apps/view/window/ViewWindow.h"

namespace ax::view {

namespace {

constexpr int forward = 1, back = -1;

bool isAny(const Item&) {
  return true;
}
bool isHeading(const Item& item) {
  return (item.node.traits & TraitHeader) != 0;
}
bool isButton(const Item& item) {
  return (item.node.traits & TraitButton) != 0;
}

template <bool (*test)(const Item&)>
void go(ViewWindow& window, int direction) {
  window.go(direction, test);
}

template <void (ViewWindow::*method)(int)>
void call(ViewWindow& window, int with) {
  (window.*method)(with);
}

template <void (ViewWindow::*method)()>
void call(ViewWindow& window, int) {
  (window.*method)();
}

std::vector<Command> allCommands() {
  std::vector<Command> all = {
      {"menu.go", "go.next", "Tab", go<isAny>, forward},
      {"menu.go", "go.previous", "Shift+Tab", go<isAny>, back},
      {"menu.go", "go.first", "Home", call<&ViewWindow::goToEnd>, back},
      {"menu.go", "go.last", "End", call<&ViewWindow::goToEnd>, forward},
      {"menu.go", "go.next.heading", "H", go<isHeading>, forward},
      {"menu.go", "go.previous.heading", "Shift+H", go<isHeading>, back},
      {"menu.go", "go.next.button", "B", go<isButton>, forward},
      {"menu.go", "go.previous.button", "Shift+B", go<isButton>, back},
      {"menu.go", "go.next.chart", "C", call<&ViewWindow::goToChart>, forward},
      {"menu.go", "go.previous.chart", "Shift+C", call<&ViewWindow::goToChart>, back},
      {"menu.act", "act.activate", "Return Enter", call<&ViewWindow::activate>},
      {"menu.act", "act.increase", "Up", call<&ViewWindow::adjust>, forward},
      {"menu.act", "act.decrease", "Down", call<&ViewWindow::adjust>, back},
      {"menu.act", "act.dismiss", "Esc", call<&ViewWindow::dismiss>},
      {"menu.chart", "chart.next", "Right", call<&ViewWindow::stepInChart>, forward},
      {"menu.chart", "chart.previous", "Left", call<&ViewWindow::stepInChart>, back},
      {"menu.chart", "chart.play", "Space", call<&ViewWindow::playChart>},
  };
  static constexpr const char* digits[] = {"1", "2", "3", "4", "5", "6", "7", "8"};
  for (int i = 0; i < 8; ++i) {
    all.push_back({"menu.chart", "chart.slice", digits[i], call<&ViewWindow::askSlice>, i});
  }
  all.insert(all.end(), {{"menu.view", "view.larger", "Ctrl++ Ctrl+=", call<&ViewWindow::zoom>, forward},
                         {"menu.view", "view.smaller", "Ctrl+-", call<&ViewWindow::zoom>, back},
                         {"menu.view", "view.actual", "Ctrl+0", call<&ViewWindow::zoom>, 0},
                         {"menu.view", "window.close", "Ctrl+Q Ctrl+W", call<&ViewWindow::leave>},
                         {"menu.help", "help.keys", "F1", call<&ViewWindow::showKeys>},
                         {"menu.help", "help.menus", "F10", call<&ViewWindow::openMenus>}});
  return all;
}

}  // namespace

const std::vector<Command>& commands() {
  static const std::vector<Command> all = allCommands();
  return all;
}

QString commandText(const Command& command) {
  return viewText(command.text, {std::int64_t(command.with) + 1});
}

}  // namespace ax::view
