#include "apps/view/window/Notice.h"

#include <QAccessible>

#include "apps/view/window/ViewStrings.h"

namespace ax::view {

namespace {

constexpr double sizeToDesktop = 1.1;

}  // namespace

Notice::Notice() {
  QFont large = font();
  large.setPointSizeF(large.pointSizeF() * sizeToDesktop);
  setFont(large);
  setWordWrap(true);
  setTextFormat(Qt::PlainText);
  setMargin(fontMetrics().height() / 3);
  // The picture stays in its place when a line comes and goes.
  QSizePolicy policy = sizePolicy();
  policy.setRetainSizeWhenHidden(true);
  setSizePolicy(policy);
  hide();
}

void Notice::announce(const QString& text) {
  setText(directed(text));
  setAccessibleName(text);
  show();
  QAccessibleEvent event(this, QAccessible::ObjectShow);
  QAccessible::updateAccessibility(&event);
}

void Notice::clearAway() {
  if (isVisible()) hide();
}

}  // namespace ax::view
