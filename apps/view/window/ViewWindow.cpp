#include "apps/view/window/ViewWindow.h"

#include <QApplication>
#include <QMenuBar>
#include <QScreen>
#include <QScrollBar>
#include <QTimer>
#include <QVBoxLayout>
#include <algorithm>
#include <iostream>
#include <map>

#include "apps/shared/Complaint.h"
#include "apps/view/model/ItemWords.h"
#include "apps/view/window/Commands.h"
#include "apps/view/window/KeyList.h"
#include "apps/view/window/Picture.h"
#include "apps/view/window/ViewStrings.h"
#include "platform/formatting/Region.h"
#include "reader/sound/ChartSound.h"
#include "reader/sound/Speech.h"
#include "reader/sound/Tone.h"
#include "reader/text/ReaderStrings.h"
#include "reader/transcript/Transcript.h"

namespace ax::view {

using reader::Action;

namespace {

constexpr double zoomStep = 1.25, leastZoom = 0.5, mostZoom = 6;
constexpr double shareOfDesktop = 0.85;
constexpr int leastWidth = 480;
constexpr int roomAround = 24;  // pixels kept visible around the focused element

// What became of an item that stayed, in words. Where the focus stays, none of it reaches speech by itself.
std::string newsOf(const ScreenChange& change, const Item& item) {
  const auto found = std::ranges::find(change.changed, item.id, &ItemChange::item);
  if (found == change.changed.end()) return "";
  const bool isOtherwise = found->selected || found->disabled || found->expansion;
  const std::string state = isOtherwise ? stateWords(item) : std::string();
  const bool needsName = found->name || (isOtherwise && state.empty());
  return reader::joined({needsName ? item.name : std::string(), state});
}

std::optional<Point> placeOfNote(const std::optional<StepNote>& note, const Rect& chart) {
  if (!note) return {};
  return Point{chart.x + note->place * chart.width, chart.maxY() - note->height * chart.height};
}

QString screenTitle(const std::string& title) {
  return QString::fromStdString(title.empty() ? reader::readerText("screen.untitled")
                                              : reader::readerText("screen.title", {title}));
}

}  // namespace

ViewWindow::ViewWindow(app::ShownScene& shown, Voice voice)
    : shown_(shown),
      voice_(voice),
      model_([&] { return shown_.snapshot(); }),
      canvas_(new ScreenCanvas(model_)),
      area_(new QScrollArea),
      caption_(new Caption),
      notice_(new Notice),
      tree_(model_, *canvas_,
            {[this](ItemId item) { focusOn(item); },
             [this](Action action, ItemId item) { follow(operate(model_, action, item)); }}) {
  setWindowTitle(screenTitle(shown_.run().title()));
  canvas_->setAccessibleName(windowTitle());
  layOut();
  fillMenus();
  listen();
  draw();
  const QSize room = screen()->availableSize() * shareOfDesktop;
  const int beside = area_->verticalScrollBar()->sizeHint().width() + 2 * area_->frameWidth();
  const int beneath =
      menuBar()->sizeHint().height() + caption_->minimumHeight() + notice_->sizeHint().height() + beside;
  resize((canvas_->size() + QSize(beside, beneath)).boundedTo(room).expandedTo({leastWidth, 0}));
  showFocus();
  // Once the window is there.
  QTimer::singleShot(0, this, [this] { notify({say(focusedLine())}); });
}

void ViewWindow::layOut() {
  auto* all = new QWidget;
  auto* column = new QVBoxLayout(all);
  column->setContentsMargins(0, 0, 0, 0);
  column->setSpacing(0);
  area_->setWidget(canvas_);
  // What stays on the screen stays in its place when the screen becomes shorter.
  area_->setAlignment(Qt::AlignHCenter | Qt::AlignTop);
  area_->viewport()->installEventFilter(this);
  area_->setFocusPolicy(Qt::NoFocus);
  area_->setSizeAdjustPolicy(QAbstractScrollArea::AdjustToContents);
  column->addWidget(area_, 1);
  column->addWidget(caption_);
  column->addWidget(notice_);
  setCentralWidget(all);
  canvas_->setFocus();
}

void ViewWindow::fillMenus() {
  std::map<std::string, QMenu*> menus;
  for (const Command& command : commands()) {
    QMenu*& menu = menus[command.menu];
    if (menu == nullptr) menu = menuBar()->addMenu(viewText(command.menu));
    QAction* action = menu->addAction(commandText(command));
    action->setShortcuts(keysOf(command));
    connect(action, &QAction::triggered, this, [this, &command] { command.run(*this, command.with); });
  }
}

void ViewWindow::listen() {
  // After Qt has told of the canvas itself.
  canvas_->onFocusIn = [this] { QTimer::singleShot(0, this, [this] { tree_.tellFocus(); }); };
  canvas_->onTouch = [this](ItemId item) {
    if (item != 0) focusOn(item);
  };
}

void ViewWindow::draw() {
  canvas_->setPicture(pictureOf(model_, shown_.run().title(), palette()), pictureColours(palette()));
}

// The desktop goes from light to dark at nightfall.
void ViewWindow::changeEvent(QEvent* event) {
  QMainWindow::changeEvent(event);
  if (event->type() == QEvent::PaletteChange) draw();
}

bool ViewWindow::eventFilter(QObject* object, QEvent* event) {
  // After the bars have their new ranges.
  if (event->type() == QEvent::Resize) QTimer::singleShot(0, this, [this] { scrollToFocus(); });
  return QMainWindow::eventFilter(object, event);
}

void ViewWindow::moveFocus(ItemId item) {
  model_.setFocus(item);
  notice_->clearAway();
  showFocus();
  tree_.tellFocus();
}

void ViewWindow::focusOn(ItemId item) {
  if (!model_.setFocus(item)) return;
  tour_.leave();
  moveFocus(item);
  notify({say(focusedLine())});
}

std::string ViewWindow::focusedLine() const {
  return focused() == nullptr ? reader::readerText("screen.empty") : focused()->line;
}

void ViewWindow::showFocus() {
  caption_->show(QString::fromStdString(focusedLine()));
  canvas_->setMark({});
  scrollToFocus();
}

void ViewWindow::scrollToFocus() {
  const Item* item = focused();
  if (item != nullptr) {
    const QRect frame = canvas_->rectOf(item->node.frame).toRect();
    area_->ensureVisible(frame.center().x(), frame.center().y(), frame.width() / 2 + roomAround,
                         frame.height() / 2 + roomAround);
  }
}

void ViewWindow::announce(const std::vector<std::string>& lines) {
  if (lines.empty()) return;
  const std::string all = reader::joined(lines);
  notify({all, say(all)});
}

void ViewWindow::notify(const std::vector<std::string>& lines) {
  const std::string all = reader::joined(lines);
  if (!all.empty()) notice_->announce(QString::fromStdString(all));
}

std::string ViewWindow::say(const std::string& line) {
  if (voice_ == Voice::none) return "";
  const auto spoken = reader::spokenSound(line, formatting::currentRegion().locale);
  return spoken ? play(*spoken) : "";
}

std::string ViewWindow::play(const reader::Sound& sound) {
  if (loudspeaker_.play(sound) || hasToldOfSilence_) return "";
  hasToldOfSilence_ = true;
  std::string told = viewText("no.sound").toStdString();
  std::cerr << "axvelto-view: " << told << '\n';
  return told;
}

void ViewWindow::follow(const Effect& effect) {
  if (effect.result == reader::ActionResult::raised) {
    app::complain(shown_.scene().file + ": the host raised when it was acted on");
  }
  if (effect.change.isAny()) {
    tour_.leave();
    draw();
    showFocus();
  }
  tree_.tell(effect.change);
  std::vector<std::string> lines = effect.announcements;
  const std::string news = focused() == nullptr ? std::string() : newsOf(effect.change, *focused());
  if (!news.empty()) lines.insert(lines.begin(), news);
  announce(lines);
}

void ViewWindow::go(int direction, const ScreenModel::Test& test) {
  const ItemId item = model_.neighbour(model_.focus(), direction, test);
  if (item == 0) return announce(viewText("nothing.more"));
  focusOn(item);
}

void ViewWindow::goToEnd(int direction) {
  const auto& order = model_.readingOrder();
  if (!order.empty()) focusOn(direction < 0 ? order.front() : order.back());
}

void ViewWindow::goToChart(int direction) {
  const ItemId here = model_.chartAround(model_.focus());
  go(direction, [&](const Item& item) {
    const ItemId chart = model_.chartAround(item.id);
    return chart != 0 && chart != here && isFirstIn(model_, chart, item.id);
  });
}

void ViewWindow::activate() {
  follow(operate(model_, Action::activate, model_.focus()));
}

void ViewWindow::adjust(int direction) {
  const Action action = direction > 0 ? Action::increment : Action::decrement;
  const Item* item = focused();
  if (item != nullptr && item->node.actions.has(action)) return follow(operate(model_, action, item->id));
  go(-direction, [](const Item&) { return true; });
}

void ViewWindow::dismiss() {
  follow(dismissModal(model_, model_.focus()));
}

void ViewWindow::stepInChart(int direction) {
  if (model_.chartAround(model_.focus()) == 0) return go(direction, [](const Item&) { return true; });
  const ChartStep* step = tour_.step(model_, model_.focus(), direction);
  if (step == nullptr) return announce(viewText("nothing.more"));
  const Item *element = model_.find(step->item), *chart = model_.find(tour_.chart());
  const std::optional<StepNote> note = noteOfStep(model_, *chart, tour_.steps(), tour_.at());
  if (element != nullptr) {
    moveFocus(element->id);
  } else {
    canvas_->setMark(placeOfNote(note, chart->node.frame));
  }
  const std::string silence = soundStep(element != nullptr ? element->line : step->line, note);
  notify({element != nullptr ? std::string() : step->line, silence});
}

std::string ViewWindow::soundStep(const std::string& line, const std::optional<StepNote>& note) {
  reader::Sound sound;
  if (note) sound = reader::note(reader::pitchOf(note->height), note->place);
  if (voice_ == Voice::own) {
    if (const auto spoken = reader::spokenSound(line, formatting::currentRegion().locale)) sound.add(*spoken);
  }
  return play(sound);
}

// A screen reader would talk into an introduction.
void ViewWindow::playChart() {
  const Item* item = model_.find(model_.chartAround(model_.focus()));
  if (item == nullptr) return announce(viewText("no.chart"));
  const reader::Node& chart = *model_.snapshot().node(item->node.id);
  const reader::Sound notes = reader::notesSound(model_.snapshot(), chart);
  if (notes.pairs() == 0) return announce({reader::readerText("chart.no.data")});
  notify({play(voice_ == Voice::own ? reader::chartSound(model_.snapshot(), chart) : notes)});
}

void ViewWindow::askSlice(int slice) {
  const Item* chart = model_.find(model_.chartAround(model_.focus()));
  if (chart == nullptr) return announce(viewText("no.chart"));
  const std::string line = sliceLine(*chart, std::size_t(slice));
  announce(line.empty() ? viewText("no.slice") : QString::fromStdString(line));
}

void ViewWindow::zoom(int direction) {
  const double factor = direction > 0 ? zoomStep : 1 / zoomStep;
  canvas_->setZoom(direction == 0 ? 1 : std::clamp(canvas_->zoom() * factor, leastZoom, mostZoom));
  showFocus();
}

void ViewWindow::showKeys() {
  (new KeyList(this))->open();
}

void ViewWindow::openMenus() {
  menuBar()->setActiveAction(menuBar()->actions().front());
}

void ViewWindow::leave() {
  close();
}

}  // namespace ax::view
