#pragma once

#include <QMainWindow>
#include <QScrollArea>

#include "apps/shared/ShownScene.h"
#include "apps/view/model/ChartTour.h"
#include "apps/view/model/Operating.h"
#include "apps/view/model/StepNote.h"
#include "apps/view/window/AccessibleTree.h"
#include "apps/view/window/Caption.h"
#include "apps/view/window/Loudspeaker.h"
#include "apps/view/window/Notice.h"
#include "apps/view/window/ScreenCanvas.h"

namespace ax::view {

// A screen in a window: its picture, the focused element's line beneath, and the keys. What a person does
// goes to the live objects, and what changed is shown and told.
class ViewWindow : public QMainWindow {
 public:
  enum class Voice { none, own };

  // With a voice of its own, it says the focused line and what happens. Throws a Fault for a scene without a
  // screen. The shown must outlive the window.
  ViewWindow(app::ShownScene& shown, Voice voice);

  // What keys and menus run.
  void go(int direction, const ScreenModel::Test& test);
  void goToEnd(int direction);
  void goToChart(int direction);
  void activate();
  void adjust(int direction);
  void dismiss();
  void stepInChart(int direction);
  void playChart();
  void askSlice(int slice);
  void zoom(int direction);
  void showKeys();
  void openMenus();
  void leave();

 protected:
  void changeEvent(QEvent* event) override;
  bool eventFilter(QObject* object, QEvent* event) override;

 private:
  void layOut();
  void fillMenus();
  void listen();
  void draw();
  void focusOn(ItemId item);
  void moveFocus(ItemId item);
  void showFocus();
  void scrollToFocus();
  void follow(const Effect& effect);
  // Answer what is to be told of it: once, that no device takes a sound; else nothing.
  std::string say(const std::string& line);
  std::string play(const reader::Sound& sound);
  std::string soundStep(const std::string& line, const std::optional<StepNote>& note);
  // One notice in place of the last.
  void notify(const std::vector<std::string>& lines);
  void announce(const std::vector<std::string>& lines);
  void announce(const QString& line) { announce(std::vector<std::string>{line.toStdString()}); }
  const Item* focused() const { return model_.find(model_.focus()); }
  std::string focusedLine() const;

  app::ShownScene& shown_;
  const Voice voice_;
  bool hasToldOfSilence_ = false;
  ScreenModel model_;
  ChartTour tour_;
  Loudspeaker loudspeaker_;
  ScreenCanvas* canvas_;
  QScrollArea* area_;
  Caption* caption_;
  Notice* notice_;
  AccessibleTree tree_;
};

}  // namespace ax::view
