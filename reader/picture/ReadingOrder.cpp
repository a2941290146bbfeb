#include "reader/picture/ReadingOrder.h"

#include "reader/speech/SpokenLine.h"

namespace ax::reader {

ReadingOrder::ReadingOrder(const Snapshot& snapshot) {
  if (snapshot.nodes().empty()) return;
  first_ = snapshot.nodes().front().id;
  for (const Node& node : snapshot.nodes()) {
    const bool isStep = isSpoken(snapshot, node);
    if (isStep) nodes_.push_back(&node);
    numbers_.push_back(isStep ? nodes_.size() : 0);
  }
}

std::size_t ReadingOrder::numberOf(const Node& node) const {
  const NodeId index = node.id - first_;
  return index < numbers_.size() ? numbers_[index] : 0;
}

}  // namespace ax::reader
