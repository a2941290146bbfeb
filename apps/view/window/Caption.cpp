#include "apps/view/window/Caption.h"

#include "apps/view/window/ViewStrings.h"

namespace ax::view {

namespace {

constexpr double sizeToDesktop = 1.8;
constexpr int linesOfRoom = 2;

}  // namespace

Caption::Caption() {
  QFont large = font();
  large.setPointSizeF(large.pointSizeF() * sizeToDesktop);
  setFont(large);
  setWordWrap(true);
  setTextFormat(Qt::PlainText);
  setAlignment(Qt::AlignLeading | Qt::AlignTop);
  setMargin(fontMetrics().height() / 3);
  setMinimumHeight(fontMetrics().lineSpacing() * linesOfRoom + 2 * margin());
  setAutoFillBackground(true);
  setBackgroundRole(QPalette::Base);
  setForegroundRole(QPalette::Text);
}

void Caption::show(const QString& line) {
  setText(directed(line));
}

}  // namespace ax::view
