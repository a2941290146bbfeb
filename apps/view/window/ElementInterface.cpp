#include "apps/view/window/ElementInterface.h"

#include "apps/view/window/AccessibleTree.h"
#include "apps/view/window/ElementRole.h"

namespace ax::view {

using reader::Action;

namespace {

struct ActionName {
  Action action;
  const QString& (*name)();
};

constexpr ActionName actionNameRows[] = {{Action::activate, &QAccessibleActionInterface::pressAction},
                                         {Action::increment, &QAccessibleActionInterface::increaseAction},
                                         {Action::decrement, &QAccessibleActionInterface::decreaseAction}};

}  // namespace

const Item* ElementInterface::item() const {
  return tree_.model().find(id_);
}

QWindow* ElementInterface::window() const {
  return tree_.canvas().window()->windowHandle();
}

QAccessibleInterface* ElementInterface::parent() const {
  const Item* own = item();
  return own == nullptr ? nullptr : tree_.interfaceOf(own->parent);
}

int ElementInterface::childCount() const {
  const Item* own = item();
  return own == nullptr ? 0 : int(own->children.size());
}

QAccessibleInterface* ElementInterface::child(int index) const {
  return index < 0 || index >= childCount() ? nullptr
                                            : tree_.interfaceOf(item()->children[std::size_t(index)]);
}

QAccessibleInterface* ElementInterface::childAt(int x, int y) const {
  for (int i = childCount() - 1; i >= 0; --i) {
    if (child(i)->rect().contains(x, y)) return child(i);
  }
  return nullptr;
}

int ElementInterface::indexOfChild(const QAccessibleInterface* child) const {
  const Item* other = tree_.itemOf(child);
  return other == nullptr || other->parent != id_ ? -1 : int(other->place);
}

QString ElementInterface::text(QAccessible::Text kind) const {
  const Item* own = item();
  if (own == nullptr) return {};
  if (kind == QAccessible::Name) return QString::fromStdString(own->name);
  if (kind == QAccessible::Description) return QString::fromStdString(own->hint);
  return {};
}

QRect ElementInterface::rect() const {
  return tree_.rectOf(id_);
}

QAccessible::Role ElementInterface::role() const {
  const Item* own = item();
  return own == nullptr ? QAccessible::NoRole : elementRole(*own);
}

QAccessible::State ElementInterface::state() const {
  const Item* own = item();
  QAccessible::State state;
  if (own == nullptr) {
    state.invalid = true;
    return state;
  }
  state = elementState(*own);
  state.focused = tree_.hasFocus(id_);
  return state;
}

void* ElementInterface::interface_cast(QAccessible::InterfaceType type) {
  if (type == QAccessible::ActionInterface) return static_cast<QAccessibleActionInterface*>(this);
  const bool isCounted = item() != nullptr && item()->isCounted();
  if (type == QAccessible::ValueInterface && isCounted) return static_cast<QAccessibleValueInterface*>(this);
  return nullptr;
}

QStringList ElementInterface::actionNames() const {
  QStringList names;
  const Item* own = item();
  if (own == nullptr) return names;
  for (const ActionName& row : actionNameRows) {
    if (own->node.actions.has(row.action)) names << row.name();
  }
  if (!own->line.empty()) names << setFocusAction();
  return names;
}

void ElementInterface::doAction(const QString& name) {
  if (!actionNames().contains(name)) return;
  if (name == setFocusAction()) return tree_.requestFocus(id_);
  for (const ActionName& row : actionNameRows) {
    if (name == row.name()) return tree_.requestAction(row.action, id_);
  }
}

QVariant ElementInterface::currentValue() const {
  return item() == nullptr ? QVariant() : QVariant(qlonglong(item()->position.number));
}

QVariant ElementInterface::maximumValue() const {
  return item() == nullptr ? QVariant() : QVariant(qlonglong(item()->position.most));
}

QVariant ElementInterface::minimumValue() const {
  return item() == nullptr ? QVariant() : QVariant(qlonglong(item()->position.least));
}

// Step by step, as far as the host follows in this direction.
void ElementInterface::setCurrentValue(const QVariant& value) {
  std::int64_t left = value.toLongLong() - currentValue().toLongLong();
  const std::int64_t direction = left > 0 ? 1 : -1;
  while (item() != nullptr && left * direction > 0) {
    const std::int64_t before = left;
    tree_.requestAction(direction > 0 ? Action::increment : Action::decrement, id_);
    left = value.toLongLong() - currentValue().toLongLong();
    if (left * direction >= before * direction) return;
  }
}

}  // namespace ax::view
