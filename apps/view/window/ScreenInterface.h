#pragma once

#include <QAccessibleWidget>

namespace ax::view {

class ScreenCanvas;

// The canvas as assistive technology meets it: a group of the screen's topmost items.
class ScreenInterface : public QAccessibleWidget {
 public:
  explicit ScreenInterface(ScreenCanvas& canvas);

  int childCount() const override;
  QAccessibleInterface* child(int index) const override;
  QAccessibleInterface* childAt(int x, int y) const override;
  QAccessibleInterface* focusChild() const override;
  int indexOfChild(const QAccessibleInterface* child) const override;
};

}  // namespace ax::view
