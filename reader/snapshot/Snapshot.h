#pragma once

#include <functional>
#include <string>
#include <vector>

#include "platform/runtime/Message.h"
#include "platform/runtime/Weak.h"
#include "platform/toolkit/View.h"
#include "reader/snapshot/Node.h"

namespace ax::reader {

class HostQuestions;

enum class ActionResult {
  done,
  notHandled,   // the object was asked and did nothing
  unavailable,  // the node has no such action
  gone,         // the node's object no longer exists
  raised        // the host raised on the way
};

// One screen as it was when its objects were asked. The nodes are plain values and outlive the objects; only
// actions and the hit test go back to these. Main thread only.
class Snapshot {
 public:
  // Every node, a parent before its children, siblings in reading order.
  const std::vector<Node>& nodes() const { return nodes_; }
  std::vector<NodeId> topNodes() const;
  // Null for an id of another snapshot.
  const Node* node(NodeId id) const;
  // The first node of an object; null when the object has none.
  const Node* nodeOf(const Object& object) const;
  // Nil when the object is gone, or when there is none behind the node.
  Ref<Object> object(NodeId id) const;
  // How often the host raised while it was asked; each time counted as nil, NO or 0.
  std::size_t timesRaised() const { return timesRaised_; }

  ActionResult perform(Action action, NodeId id) const;
  // The element under a point in screen space: what the deepest view there that answers hit tests itself
  // says, else the front-most. Null when there is none.
  const Node* hitTest(Point point, HostQuestions& questions) const;
  const Node* hitTest(Point point) const;

 private:
  friend class SnapshotWalk;

  const Node* frontMostElement(const Ref<View>& view, Point point, HostQuestions& questions) const;

  std::vector<Node> nodes_;  // ids are consecutive
  std::vector<Weak<Object>> objects_;
  Weak<Object> screen_;
  std::size_t timesRaised_ = 0;
};

// The names that the objects' maker knows them by, or "".
using ObjectNames = std::function<std::string(const Object&)>;

// Asks a screen once: a view controller, a view, a layer or any other accessible object. What is nil, hidden
// or says nothing of itself makes no node.
Snapshot takeSnapshot(Receiver screen, const ObjectNames& names = nullptr);

}  // namespace ax::reader
