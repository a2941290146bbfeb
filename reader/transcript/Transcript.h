#pragma once

#include <string>
#include <vector>

#include "reader/snapshot/Snapshot.h"

// What a screen reader says, in the language of the environment. Works from snapshots alone. Main thread
// only.
namespace ax::reader {

// A node that is read, and how.
struct SpokenNode {
  NodeId node = 0;
  std::string line = {};    // never empty
  bool opensModal = false;  // the first in what covers the rest of the screen; its line says so
};

// What is spoken of a screen, in reading order: each element, and a chart with a name that holds none.
std::vector<SpokenNode> spokenNodes(const Snapshot& snapshot);

// The screen's title, then a line for each element in reading order, and for a chart with a name that holds
// none. What covers the rest of the screen says so with its first element.
std::vector<std::string> transcript(const Snapshot& snapshot, const std::string& title);

}  // namespace ax::reader
