#pragma once

#include "reader/snapshot/HostQuestions.h"
#include "reader/snapshot/Node.h"

namespace ax::reader {

// What a live object says of itself, without its place in the tree, its ids and its data series.
Node readNode(Object& object, HostQuestions& questions);

}  // namespace ax::reader
