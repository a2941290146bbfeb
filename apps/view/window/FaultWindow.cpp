#include "apps/view/window/FaultWindow.h"

#include <QLabel>
#include <QShortcut>

#include "apps/view/window/ViewStrings.h"

namespace ax::view {

FaultWindow::FaultWindow(const reader::Fault& fault) {
  setWindowTitle(viewText("fault.title"));
  auto* text = new QLabel(QString::fromStdString(fault.text()));
  text->setTextFormat(Qt::PlainText);
  text->setWordWrap(true);
  text->setMargin(24);
  text->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
  setCentralWidget(text);
  text->setFocus();
  for (const char* keys : {"Esc", "Ctrl+Q", "Ctrl+W"}) {
    connect(new QShortcut(QKeySequence(keys), this), &QShortcut::activated, this, &QWidget::close);
  }
  resize(480, 200);
}

}  // namespace ax::view
