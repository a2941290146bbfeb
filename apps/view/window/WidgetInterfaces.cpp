#include "apps/view/window/WidgetInterfaces.h"

#include "apps/view/window/AccessibleTree.h"
#include "apps/view/window/Caption.h"
#include "apps/view/window/Notice.h"
#include "apps/view/window/ScreenCanvas.h"
#include "apps/view/window/ScreenInterface.h"

namespace ax::view {

QAccessibleInterface* widgetInterface(const QString&, QObject* object) {
  if (auto* notice = dynamic_cast<Notice*>(object)) {
    return new QAccessibleWidget(notice, QAccessible::Notification);
  }
  if (auto* caption = dynamic_cast<Caption*>(object)) return new QAccessibleWidget(caption);
  auto* canvas = dynamic_cast<ScreenCanvas*>(object);
  return canvas != nullptr && AccessibleTree::of(canvas) != nullptr ? new ScreenInterface(*canvas) : nullptr;
}

}  // namespace ax::view
