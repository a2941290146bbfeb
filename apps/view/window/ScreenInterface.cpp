#include "apps/view/window/ScreenInterface.h"

#include "apps/view/window/AccessibleTree.h"
#include "apps/view/window/ScreenCanvas.h"

namespace ax::view {

ScreenInterface::ScreenInterface(ScreenCanvas& canvas) : QAccessibleWidget(&canvas, QAccessible::Client) {}

int ScreenInterface::childCount() const {
  AccessibleTree* tree = AccessibleTree::of(widget());
  return tree == nullptr ? 0 : int(tree->model().top().size());
}

QAccessibleInterface* ScreenInterface::child(int index) const {
  if (index < 0 || index >= childCount()) return nullptr;
  AccessibleTree* tree = AccessibleTree::of(widget());
  return tree->interfaceOf(tree->model().top()[std::size_t(index)]);
}

QAccessibleInterface* ScreenInterface::childAt(int x, int y) const {
  AccessibleTree* tree = AccessibleTree::of(widget());
  const auto* canvas = static_cast<const ScreenCanvas*>(widget());
  if (tree == nullptr) return nullptr;
  const ItemId item = tree->model().itemAt(canvas->pointOf(canvas->mapFromGlobal(QPoint(x, y))));
  return item == 0 ? nullptr : tree->interfaceOf(item);
}

QAccessibleInterface* ScreenInterface::focusChild() const {
  AccessibleTree* tree = AccessibleTree::of(widget());
  return tree == nullptr || tree->model().focus() == 0 ? nullptr : tree->interfaceOf(tree->model().focus());
}

int ScreenInterface::indexOfChild(const QAccessibleInterface* child) const {
  AccessibleTree* tree = AccessibleTree::of(widget());
  const Item* item = tree == nullptr ? nullptr : tree->itemOf(child);
  return item == nullptr || item->parent != 0 ? -1 : int(item->place);
}

}  // namespace ax::view
