#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "reader/snapshot/Node.h"

namespace ax::view {

// Stays the same for as long as the same object is on the screen, and is never used again; 0 is no item.
using ItemId = std::uint64_t;

// Where an adjustable element stands, as a number. Counted from `least` in whole steps.
struct Position {
  std::int64_t number = 0;
  std::int64_t least = 0;
  std::int64_t most = 0;
  bool operator==(const Position&) const = default;
};

// One node of the screen, over time.
struct Item {
  ItemId id = 0;
  ItemId parent = 0;  // 0 at the top
  std::vector<ItemId> children = {};
  std::size_t place = 0;    // among its siblings
  reader::Node node = {};   // as it said last
  std::string line = {};    // what is spoken; empty for one that keys pass over
  std::string name = {};    // the line without what role and states tell, and without the hint
  std::string hint = {};    // empty where the name says it already
  bool opensModal = false;  // the first in what covers the rest of the screen
  Position position = {};   // of an adjustable that counts; else all zero
  bool isCounted() const { return position.most > position.least; }
};

}  // namespace ax::view
