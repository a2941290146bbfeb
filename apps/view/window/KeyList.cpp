#include "apps/view/window/KeyList.h"

#include <QLabel>
#include <QListWidget>
#include <QVBoxLayout>

#include "apps/view/window/ViewStrings.h"

namespace ax::view {

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
    list->addItem(commandText(command) + ": " + key);
  }
  list->setCurrentRow(0);
  auto* arrows = new QLabel(viewText("help.arrows"));
  arrows->setWordWrap(true);
  auto* column = new QVBoxLayout(this);
  column->addWidget(list);
  column->addWidget(arrows);
  resize(420, 520);
}

}  // namespace ax::view
