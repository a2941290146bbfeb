#pragma once

#include <QAccessible>

#include "apps/view/model/Item.h"

namespace ax::view {

class AccessibleTree;

// One item as assistive technology meets it: no widget, and nothing kept but its id. Invalid once the item
// is gone. Owned by Qt from its registration on.
class ElementInterface : public QAccessibleInterface,
                         public QAccessibleActionInterface,
                         public QAccessibleValueInterface {
 public:
  ElementInterface(AccessibleTree& tree, ItemId id) : tree_(tree), id_(id) {}

  ItemId id() const { return id_; }

  bool isValid() const override { return item() != nullptr; }
  QObject* object() const override { return nullptr; }
  QWindow* window() const override;
  QAccessibleInterface* parent() const override;
  QAccessibleInterface* child(int index) const override;
  QAccessibleInterface* childAt(int x, int y) const override;
  int childCount() const override;
  int indexOfChild(const QAccessibleInterface* child) const override;
  QString text(QAccessible::Text kind) const override;
  void setText(QAccessible::Text, const QString&) override {}
  QRect rect() const override;
  QAccessible::Role role() const override;
  QAccessible::State state() const override;
  void* interface_cast(QAccessible::InterfaceType type) override;

  QStringList actionNames() const override;
  void doAction(const QString& name) override;
  QStringList keyBindingsForAction(const QString&) const override { return {}; }

  QVariant currentValue() const override;
  void setCurrentValue(const QVariant& value) override;
  QVariant maximumValue() const override;
  QVariant minimumValue() const override;
  QVariant minimumStepSize() const override { return 1; }

 private:
  const Item* item() const;

  AccessibleTree& tree_;
  const ItemId id_;
};

}  // namespace ax::view
