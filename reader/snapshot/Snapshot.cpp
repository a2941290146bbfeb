#include "reader/snapshot/Snapshot.h"

#include <algorithm>

#include "platform/toolkit/AccessibilityMessages.h"

namespace ax::reader {

namespace {

ActionResult performOn(Object& object, Action action) {
  switch (action) {
    case Action::activate:
      return messages::accessibilityActivate(object) ? ActionResult::done : ActionResult::notHandled;
    case Action::increment:
      messages::accessibilityIncrement(object);
      return ActionResult::done;
    case Action::decrement:
      messages::accessibilityDecrement(object);
      return ActionResult::done;
  }
  return ActionResult::unavailable;
}

}  // namespace

std::vector<NodeId> Snapshot::topNodes() const {
  std::vector<NodeId> top;
  for (const Node& node : nodes_) {
    if (node.parent == 0) top.push_back(node.id);
  }
  return top;
}

const Node* Snapshot::node(NodeId id) const {
  if (nodes_.empty() || id < nodes_.front().id || id > nodes_.back().id) return nullptr;
  return &nodes_[id - nodes_.front().id];
}

const Node* Snapshot::nodeOf(const Object& object) const {
  const auto found =
      std::ranges::find_if(objects_, [&](const Weak<Object>& link) { return link.get() == &object; });
  return found == objects_.end() ? nullptr : &nodes_[std::size_t(found - objects_.begin())];
}

Ref<Object> Snapshot::object(NodeId id) const {
  const Node* found = node(id);
  return found == nullptr ? nullptr : objects_[std::size_t(found - nodes_.data())].lock();
}

ActionResult Snapshot::perform(Action action, NodeId id) const {
  const Node* target = node(id);
  if (target == nullptr || !target->actions.has(action)) return ActionResult::unavailable;
  const Ref<Object> live = object(id);
  if (!live) return ActionResult::gone;
  try {
    return performOn(*live, action);
  } catch (...) {
    return ActionResult::raised;
  }
}

}  // namespace ax::reader
