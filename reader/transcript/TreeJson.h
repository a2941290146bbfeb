#pragma once

#include <nlohmann/json.hpp>

#include "reader/snapshot/Snapshot.h"

namespace ax::reader {

// The top nodes with their children inside them, in reading order. What a node does not have is null; empty
// lists and what has no meaning for the node are left out.
nlohmann::ordered_json treeAsJson(const Snapshot& snapshot);

}  // namespace ax::reader
