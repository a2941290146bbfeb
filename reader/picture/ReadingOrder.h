#pragma once

#include <vector>

#include "reader/snapshot/Snapshot.h"

namespace ax::reader {

// What a listener steps through, numbered from 1: the elements of a snapshot, and its named charts that hold
// none. The snapshot must outlive it.
class ReadingOrder {
 public:
  explicit ReadingOrder(const Snapshot& snapshot);

  // The node numbered n stands at n - 1.
  const std::vector<const Node*>& nodes() const { return nodes_; }
  // 0 for what is not stepped to.
  std::size_t numberOf(const Node& node) const;

 private:
  NodeId first_ = 0;
  std::vector<const Node*> nodes_;
  std::vector<std::size_t> numbers_;  // of each node of the snapshot
};

}  // namespace ax::reader
