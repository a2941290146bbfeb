#pragma once

#include <functional>
#include <unordered_map>

#include "apps/view/model/Item.h"
#include "apps/view/model/ScreenChange.h"
#include "reader/snapshot/Snapshot.h"

namespace ax::view {

// A screen as a person goes through it: items that keep their identity while the screen is asked anew, and
// the one that has the focus. Main thread only.
class ScreenModel {
 public:
  using Asking = std::function<reader::Snapshot()>;
  using Test = std::function<bool(const Item&)>;

  // Asks at once; the focus is on the first item that is read.
  explicit ScreenModel(Asking ask);

  // Null for nobody. It must live until it is taken away.
  void setListener(ScreenListener* listener) { listener_ = listener; }

  const reader::Snapshot& snapshot() const { return snapshot_; }
  // Null for an item that is gone.
  const Item* find(ItemId id) const;
  const std::vector<ItemId>& top() const { return top_; }
  // The items that are spoken.
  const std::vector<ItemId>& readingOrder() const { return order_; }
  ItemId itemOf(reader::NodeId node) const;
  // The element under a point in screen space, or 0.
  ItemId itemAt(Point point) const;
  // The item, or the nearest around it, that is a chart with a series; 0 outside charts.
  ItemId chartAround(ItemId id) const;
  // The nearest item around it that covers the rest of the screen, or 0.
  ItemId modalAround(ItemId id) const;

  // 0 on a screen without anything to read.
  ItemId focus() const { return focus_; }
  // False for an item that is not read.
  bool setFocus(ItemId id);
  // The nearest item before (-1) or after (1) another in reading order that passes the test; 0 for none.
  ItemId neighbour(ItemId from, int direction, const Test& test) const;

  // Acts on the live object. The screen stays as it was asked last.
  reader::ActionResult perform(reader::Action action, ItemId id) const;
  // Asks anew. An item stays where its object stands at its place among the same siblings.
  ScreenChange refresh();

 private:
  using Items = std::unordered_map<ItemId, Item>;
  using ItemOfNode = std::vector<ItemId>;  // by a node's index in the snapshot

  Items itemsOf(const reader::Snapshot& snapshot, const ItemOfNode& ids) const;
  void tellOfLeaving(const ItemOfNode& staying) const;
  void adopt(reader::Snapshot snapshot, const ItemOfNode& ids, ScreenChange& change);
  void placeFocus(const Object* object, std::size_t formerPlace);
  std::size_t placeInOrder(ItemId id) const;

  Asking ask_;
  ScreenListener* listener_ = nullptr;
  reader::Snapshot snapshot_;
  Items items_;
  ItemOfNode idsByNode_;
  std::vector<ItemId> top_, order_;
  std::unordered_map<ItemId, std::size_t> places_;  // in the reading order
  ItemId focus_ = 0;
};

}  // namespace ax::view
