#pragma once

#include <functional>
#include <vector>

#include "apps/view/model/Item.h"
#include "reader/snapshot/Snapshot.h"

namespace ax::view {

// Finds the items of one asking of a screen again in the next: by their objects, and where these are made
// anew at every question, by what they are. Siblings that changed their order do not stay.
class ItemMatching {
 public:
  using Find = std::function<const Item*(ItemId)>;

  ItemMatching(const reader::Snapshot& before, const reader::Snapshot& now, Find find);

  // For each node of the newer snapshot, by its index, the item that it was; 0 for a new one.
  std::vector<ItemId> match(const std::vector<ItemId>& formerTop);

 private:
  class Siblings;

  void matchSiblings(const std::vector<ItemId>& former, const std::vector<reader::NodeId>& nodes);

  const reader::Snapshot& before_;
  const reader::Snapshot& now_;
  Find find_;
  std::vector<ItemId> matched_;
};

}  // namespace ax::view
