#include "apps/view/window/AccessibleTree.h"

#include "apps/view/window/ElementInterface.h"
#include "apps/view/window/ScreenCanvas.h"
#include "apps/view/window/WidgetInterfaces.h"

namespace ax::view {

namespace {

AccessibleTree* theTree = nullptr;

void send(QAccessibleEvent&& event) {
  QAccessible::updateAccessibility(&event);
}

}  // namespace

AccessibleTree::AccessibleTree(ScreenModel& model, ScreenCanvas& canvas, Requests requests)
    : model_(model), canvas_(canvas), requests_(std::move(requests)) {
  theTree = this;
  model_.setListener(this);
  QAccessible::installFactory(widgetInterface);
}

AccessibleTree::~AccessibleTree() {
  QAccessible::removeFactory(widgetInterface);
  for (const auto& [item, id] : ids_) QAccessible::deleteAccessibleInterface(id);
  model_.setListener(nullptr);
  theTree = nullptr;
}

AccessibleTree* AccessibleTree::of(const QWidget* canvas) {
  return theTree != nullptr && &theTree->canvas() == canvas ? theTree : nullptr;
}

QWidget& AccessibleTree::canvas() const {
  return canvas_;
}

QAccessibleInterface* AccessibleTree::interfaceOf(ItemId id) {
  if (id == 0) return QAccessible::queryAccessibleInterface(&canvas_);
  if (model_.find(id) == nullptr) return nullptr;
  const auto [found, isNew] = ids_.try_emplace(id);
  if (isNew) found->second = QAccessible::registerAccessibleInterface(new ElementInterface(*this, id));
  return QAccessible::accessibleInterface(found->second);
}

const Item* AccessibleTree::itemOf(const QAccessibleInterface* element) const {
  const auto* own = dynamic_cast<const ElementInterface*>(element);
  return own == nullptr ? nullptr : model_.find(own->id());
}

QRect AccessibleTree::rectOf(ItemId id) const {
  const Item* item = model_.find(id);
  if (item == nullptr) return {};
  const QRect onCanvas = canvas_.rectOf(item->node.frame).toRect();
  return {canvas_.mapToGlobal(onCanvas.topLeft()), onCanvas.size()};
}

bool AccessibleTree::hasFocus(ItemId id) const {
  return canvas_.hasFocus() && model_.focus() == id;
}

void AccessibleTree::itemsAboutToGo(const std::vector<ItemId>& items) {
  for (const ItemId id : items) {
    const auto known = ids_.find(id);
    if (known == ids_.end()) continue;
    send(QAccessibleEvent(interfaceOf(id), QAccessible::ObjectDestroyed));
    QAccessible::deleteAccessibleInterface(known->second);
    ids_.erase(known);
  }
}

void AccessibleTree::tell(const ScreenChange& change) {
  if (!QAccessible::isActive()) return;
  for (const ItemId id : change.added) send(QAccessibleEvent(interfaceOf(id), QAccessible::ObjectCreated));
  for (const ItemChange& one : change.changed) tell(one);
  if (change.isElsewhere) tellFocus();
}

void AccessibleTree::tell(const ItemChange& change) {
  QAccessibleInterface* element = interfaceOf(change.item);
  if (change.name) send(QAccessibleEvent(element, QAccessible::NameChanged));
  if (change.hint) send(QAccessibleEvent(element, QAccessible::DescriptionChanged));
  if (change.frame) send(QAccessibleEvent(element, QAccessible::LocationChanged));
  if (change.position) {
    send(QAccessibleValueChangeEvent(element, qlonglong(model_.find(change.item)->position.number)));
  }
  QAccessible::State state;
  state.selected = change.selected;
  state.disabled = change.disabled;
  state.expanded = state.collapsed = change.expansion;
  if (change.selected || change.disabled || change.expansion) tellState(change.item, state);
}

void AccessibleTree::tellState(ItemId id, QAccessible::State changed) {
  send(QAccessibleStateChangeEvent(interfaceOf(id), changed));
}

void AccessibleTree::tellFocus() {
  if (!QAccessible::isActive() || !canvas_.hasFocus()) return;
  if (QAccessibleInterface* element = interfaceOf(model_.focus())) {
    send(QAccessibleEvent(element, QAccessible::Focus));
  }
}

}  // namespace ax::view
