#include "apps/view/model/ItemMatching.h"

#include <deque>
#include <string>
#include <unordered_map>

namespace ax::view {

using reader::Node;
using reader::NodeId;
using reader::Snapshot;

namespace {

std::string likenessOf(const Node& node) {
  return node.className + '\n' + node.objectId + '\n' + (node.label ? node.label->text : std::string());
}

}  // namespace

// The former items below one parent, taken one after the other.
class ItemMatching::Siblings {
 public:
  Siblings(const Snapshot& before, const Find& find, const std::vector<ItemId>& former) {
    for (const ItemId id : former) {
      const Item* item = find(id);
      if (const Ref<Object> object = before.object(item->node.id)) {
        byObject_.emplace(object.get(), item);
      } else {
        byLikeness_[likenessOf(item->node)].push_back(item);
      }
    }
  }

  const Item* take(const Object* object, const Node& node) {
    const Item* item = nullptr;
    if (const auto found = byObject_.find(object); object != nullptr && found != byObject_.end()) {
      item = found->second;
    } else if (const auto alike = byLikeness_.find(likenessOf(node)); alike != byLikeness_.end()) {
      item = firstAfter(alike->second);
    }
    if (item == nullptr || item->place < next_) return nullptr;
    next_ = item->place + 1;
    return item;
  }

 private:
  const Item* firstAfter(std::deque<const Item*>& items) const {
    while (!items.empty() && items.front()->place < next_) items.pop_front();
    return items.empty() ? nullptr : items.front();
  }

  std::unordered_map<const Object*, const Item*> byObject_;
  std::unordered_map<std::string, std::deque<const Item*>> byLikeness_;
  std::size_t next_ = 0;  // the place behind the last one taken
};

ItemMatching::ItemMatching(const Snapshot& before, const Snapshot& now, Find find)
    : before_(before), now_(now), find_(std::move(find)), matched_(now.nodes().size()) {}

std::vector<ItemId> ItemMatching::match(const std::vector<ItemId>& formerTop) {
  matchSiblings(formerTop, now_.topNodes());
  return std::move(matched_);
}

void ItemMatching::matchSiblings(const std::vector<ItemId>& former, const std::vector<NodeId>& nodes) {
  if (former.empty() || nodes.empty()) return;
  Siblings siblings(before_, find_, former);
  for (const NodeId id : nodes) {
    const Node* node = now_.node(id);
    const Item* item = siblings.take(now_.object(id).get(), *node);
    if (item == nullptr) continue;
    matched_[std::size_t(node - now_.nodes().data())] = item->id;
    matchSiblings(item->children, node->children);
  }
}

}  // namespace ax::view
