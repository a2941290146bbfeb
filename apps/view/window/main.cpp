#include <CLI/CLI.hpp>
#include <QApplication>
#include <iostream>
#include <optional>

#include "apps/view/window/FaultWindow.h"
#include "apps/view/window/ViewWindow.h"
#include "platform/formatting/Region.h"

namespace {

using namespace ax;

enum ExitCode : int { exitDone = 0, exitBadUse = 2 };

int showFault(const reader::Fault& fault) {
  std::cerr << fault.text() << '\n';
  view::FaultWindow window(fault);
  window.show();
  QApplication::exec();
  return exitBadUse;
}

// A host that raises where nobody expected it does not close the window.
class Application : public QApplication {
 public:
  using QApplication::QApplication;

  bool notify(QObject* receiver, QEvent* event) override {
    try {
      return QApplication::notify(receiver, event);
    } catch (const reader::Fault& fault) {
      std::cerr << fault.text() << '\n';
    } catch (...) {
      std::cerr << "axvelto-view: the host raised\n";
    }
    return true;
  }
};

int showScreen(const app::Opening& opening, view::ViewWindow::Voice voice) {
  std::optional<app::ShownScene> shown;
  std::optional<view::ViewWindow> window;
  try {
    shown.emplace(opening);
    QApplication::setLayoutDirection(formatting::currentLanguageIsRightToLeft() ? Qt::RightToLeft
                                                                                : Qt::LeftToRight);
    window.emplace(*shown, voice);
  } catch (const reader::Fault& fault) {
    return showFault(fault);
  }
  window->show();
  return QApplication::exec();
}

std::string usageFailure(const CLI::App*, const CLI::Error& error) {
  return "axvelto-view: " + std::string(error.what()) + " (axvelto-view --help tells the use)\n";
}

}  // namespace

int main(int argc, char** argv) {
  CLI::App use("Opens a screen of the activity app in a window that screen readers read.", "axvelto-view");
  use.set_version_flag("--version", "axvelto-view " AXVELTO_VERSION);
  use.failure_message(usageFailure);
  app::Opening opening;
  use.add_option("FILE", opening.files, "a scene or a workout file, or - for standard input")
      ->required()
      ->expected(1);
  use.add_option("--locale", opening.locale, "the language and region to speak for, such as de_DE");
  use.add_option("--time-zone", opening.timeZone, "of a workout file, such as Europe/Berlin");
  use.add_option("--without", opening.without, "a class or member that the host does without");
  bool speaks = false;
  use.add_flag("--speak", speaks, "says the focused element and what happens");
  try {
    use.parse(argc, argv);
  } catch (const CLI::ParseError& error) {
    return use.exit(error) == 0 ? exitDone : exitBadUse;
  }
  Application application(argc, argv);
  return showScreen(opening, speaks ? view::ViewWindow::Voice::own : view::ViewWindow::Voice::none);
}
