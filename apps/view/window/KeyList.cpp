#include "apps/view/window/KeyList.h"

#include <QLabel>
#include <QListWidget>
#include <QScreen>
#include <QVBoxLayout>

#include "apps/view/window/ViewStrings.h"

namespace ax::view {

namespace {

constexpr QSize usualSize(420, 560);
constexpr double shareOfDesktop = 0.85;

// The signs of a key keep their order in text that runs from right to left.
QString isolated(const QString& key) {
  constexpr QChar leftToRightIsolate(0x2066), endOfIsolate(0x2069);
  return leftToRightIsolate + key + endOfIsolate;
}

}  // namespace

QList<QKeySequence> keysOf(const Command& command) {
  QList<QKeySequence> keys;
  for (const QString& key : QString(command.keys).split(' ')) keys << QKeySequence(key);
  return keys;
}

KeyList::KeyList(QWidget* parent) : QDialog(parent) {
  setAttribute(Qt::WA_DeleteOnClose);
  setWindowTitle(viewText("help.keys"));
  auto* list = new QListWidget;
  list->setAccessibleName(windowTitle());
  for (const Command& command : commands()) {
    const QString key = keysOf(command).front().toString(QKeySequence::NativeText);
    auto* row = new QListWidgetItem(commandText(command) + ": " + isolated(key), list);
    row->setData(Qt::AccessibleTextRole, QString(commandText(command) + ": " + key));
  }
  list->setCurrentRow(0);
  auto* arrows = new QLabel(viewText("help.arrows"));
  arrows->setWordWrap(true);
  auto* column = new QVBoxLayout(this);
  column->addWidget(list);
  column->addWidget(arrows);
  resize(usualSize.boundedTo(screen()->availableSize() * shareOfDesktop));
}

}  // namespace ax::view
