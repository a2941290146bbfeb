#include "apps/view/window/Notice.h"

#include <QAccessible>

#include "apps/view/window/ViewStrings.h"

namespace ax::view {

Notice::Notice() {
  setWordWrap(true);
  setTextFormat(Qt::PlainText);
  setMargin(fontMetrics().height() / 2);
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
