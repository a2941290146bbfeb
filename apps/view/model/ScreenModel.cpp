#include "apps/view/model/ScreenModel.h"

#include <algorithm>

#include "apps/view/model/ItemMatching.h"
#include "apps/view/model/ItemWords.h"
#include "platform/toolkit/Control.h"
#include "reader/transcript/Transcript.h"

namespace ax::view {

using reader::Node;
using reader::NodeId;
using reader::Snapshot;

namespace {

ItemId lastId = 0;

bool isRead(const Item& item) {
  return !item.line.empty();
}

// Pages count from 1, as they are spoken.
Position positionOf(const Ref<Object>& object) {
  const PageControl* pages = cast<PageControl>(object.get());
  if (pages == nullptr || pages->numberOfPages() == 0) return {};
  return {pages->currentPage() + 1, 1, pages->numberOfPages()};
}

ItemChange difference(const Item& before, const Item& now) {
  const reader::States &was = before.node.states, &is = now.node.states;
  return {.item = now.id,
          .name = before.name != now.name,
          .hint = before.hint != now.hint,
          .position = before.position != now.position,
          .frame = before.node.frame != now.node.frame,
          .selected = was.selected != is.selected,
          .disabled = was.disabled != is.disabled,
          .expansion = was.expanded != is.expanded || was.collapsed != is.collapsed};
}

void addSpokenLines(const Snapshot& snapshot, std::vector<Item>& items) {
  for (reader::SpokenNode& spoken : reader::spokenNodes(snapshot)) {
    Item& item = items[std::size_t(snapshot.node(spoken.node) - snapshot.nodes().data())];
    item.line = std::move(spoken.line);
    item.opensModal = spoken.opensModal;
  }
}

}  // namespace

ScreenModel::ScreenModel(Asking ask) : ask_(std::move(ask)) {
  refresh();
}

const Item* ScreenModel::find(ItemId id) const {
  const auto found = items_.find(id);
  return found == items_.end() ? nullptr : &found->second;
}

ItemId ScreenModel::itemOf(NodeId node) const {
  const Node* found = snapshot_.node(node);
  return found == nullptr ? 0 : idsByNode_[std::size_t(found - snapshot_.nodes().data())];
}

ItemId ScreenModel::itemAt(Point point) const {
  const Node* node = snapshot_.hitTest(point);
  return node == nullptr ? 0 : itemOf(node->id);
}

ItemId ScreenModel::chartAround(ItemId id) const {
  const Item* item = find(id);
  while (item != nullptr && !item->node.series) item = find(item->parent);
  return item == nullptr ? 0 : item->id;
}

ItemId ScreenModel::modalAround(ItemId id) const {
  const Item* item = find(id);
  while (item != nullptr && !item->node.states.modal) item = find(item->parent);
  return item == nullptr ? 0 : item->id;
}

bool ScreenModel::setFocus(ItemId id) {
  const Item* item = find(id);
  if (item == nullptr || !isRead(*item)) return false;
  focus_ = id;
  return true;
}

std::size_t ScreenModel::placeInOrder(ItemId id) const {
  const auto found = places_.find(id);
  return found == places_.end() ? order_.size() : found->second;
}

ItemId ScreenModel::neighbour(ItemId from, int direction, const Test& test) const {
  for (std::size_t i = placeInOrder(from); i < order_.size();) {
    if (direction < 0 && i == 0) break;
    i += std::size_t(direction);  // wraps below 0 and comes back
    if (i < order_.size() && test(*find(order_[i]))) return order_[i];
  }
  return 0;
}

reader::ActionResult ScreenModel::perform(reader::Action action, ItemId id) const {
  const Item* item = find(id);
  return item == nullptr ? reader::ActionResult::gone : snapshot_.perform(action, item->node.id);
}

ScreenChange ScreenModel::refresh() {
  Snapshot now = ask_();
  const auto findItem = [this](ItemId id) { return find(id); };
  ItemOfNode ids = ItemMatching(snapshot_, now, findItem).match(top_);
  tellOfLeaving(ids);
  const Item* focused = find(focus_);
  const Ref<Object> object = focused == nullptr ? nullptr : snapshot_.object(focused->node.id);
  const ItemId formerFocus = focus_;
  const std::size_t formerPlace = focused == nullptr ? 0 : placeInOrder(focus_);
  ScreenChange change;
  for (ItemId& id : ids) {
    if (id == 0) change.added.push_back(id = ++lastId);
  }
  adopt(std::move(now), ids, change);
  placeFocus(object.get(), formerPlace);
  change.isElsewhere = focus_ != formerFocus;
  return change;
}

void ScreenModel::tellOfLeaving(const ItemOfNode& staying) const {
  if (listener_ == nullptr) return;
  std::vector<ItemId> sorted = staying, leaving;
  std::ranges::sort(sorted);
  for (auto id = idsByNode_.rbegin(); id != idsByNode_.rend(); ++id) {
    if (!std::ranges::binary_search(sorted, *id)) leaving.push_back(*id);
  }
  if (!leaving.empty()) listener_->itemsAboutToGo(leaving);
}

ScreenModel::Items ScreenModel::itemsOf(const Snapshot& snapshot, const ItemOfNode& ids) const {
  const auto idOf = [&](NodeId node) {
    const Node* found = snapshot.node(node);
    return found == nullptr ? 0 : ids[std::size_t(found - snapshot.nodes().data())];
  };
  std::vector<Item> list(snapshot.nodes().size());
  addSpokenLines(snapshot, list);
  Items items;
  for (std::size_t i = 0; i < list.size(); ++i) {
    Item& item = list[i];
    item.node = snapshot.nodes()[i];
    item.id = ids[i];
    item.parent = idOf(item.node.parent);
    for (const NodeId child : item.node.children) item.children.push_back(idOf(child));
    item.position = positionOf(snapshot.object(item.node.id));
    nameItem(item);
    items.emplace(item.id, std::move(item));
  }
  return items;
}

void ScreenModel::adopt(Snapshot snapshot, const ItemOfNode& ids, ScreenChange& change) {
  const Items before = std::exchange(items_, itemsOf(snapshot, ids));
  snapshot_ = std::move(snapshot);
  idsByNode_ = ids;
  top_.clear(), order_.clear(), places_.clear();
  for (const ItemId id : ids) {
    Item& item = items_.at(id);
    if (item.parent == 0) top_.push_back(id);
    for (std::size_t i = 0; i < item.children.size(); ++i) items_.at(item.children[i]).place = i;
    if (isRead(item)) places_[id] = order_.size(), order_.push_back(id);
    const auto former = before.find(id);
    const ItemChange changed = former == before.end() ? ItemChange() : difference(former->second, item);
    if (changed.isAny()) change.changed.push_back(changed);
  }
  for (std::size_t i = 0; i < top_.size(); ++i) items_.at(top_[i]).place = i;
}

// On its object, where that is read under another item now, else on what is read in its place.
void ScreenModel::placeFocus(const Object* object, std::size_t formerPlace) {
  if (places_.contains(focus_)) return;
  focus_ = 0;
  const Node* node = object == nullptr ? nullptr : snapshot_.nodeOf(*object);
  if (node != nullptr && setFocus(itemOf(node->id))) return;
  if (!order_.empty()) focus_ = order_[std::min(formerPlace, order_.size() - 1)];
}

}  // namespace ax::view
