#pragma once

#include <QAccessible>
#include <QWidget>
#include <functional>
#include <unordered_map>

#include "apps/view/model/ScreenModel.h"

namespace ax::view {

class ScreenCanvas;

// The items of a screen as one tree of accessible objects, below the canvas that shows them. Objects are made
// when they are asked for, and changes are told to assistive technology one by one.
class AccessibleTree : public ScreenListener {
 public:
  struct Requests {
    std::function<void(ItemId)> focus;
    std::function<void(reader::Action, ItemId)> action;
  };

  // Serves one canvas of the process; all must outlive it.
  AccessibleTree(ScreenModel& model, ScreenCanvas& canvas, Requests requests);
  ~AccessibleTree() override;

  ScreenModel& model() const { return model_; }
  QWidget& canvas() const;
  // The canvas's own for 0; null for an item that is gone.
  QAccessibleInterface* interfaceOf(ItemId id);
  // Null for an interface of something else, or of an item that is gone.
  const Item* itemOf(const QAccessibleInterface* element) const;
  // In pixels of the desktop.
  QRect rectOf(ItemId id) const;
  bool hasFocus(ItemId id) const;

  void requestFocus(ItemId id) { requests_.focus(id); }
  void requestAction(reader::Action action, ItemId id) { requests_.action(action, id); }

  void itemsAboutToGo(const std::vector<ItemId>& items) override;
  void tell(const ScreenChange& change);
  void tellFocus();

  // The tree of a canvas.
  static AccessibleTree* of(const QWidget* canvas);

 private:
  void tell(const ItemChange& change);
  void tellState(ItemId id, QAccessible::State changed);

  ScreenModel& model_;
  ScreenCanvas& canvas_;
  Requests requests_;
  std::unordered_map<ItemId, QAccessible::Id> ids_;
};

}  // namespace ax::view
