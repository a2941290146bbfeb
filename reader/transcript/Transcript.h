#pragma once

#include <string>
#include <vector>

#include "reader/snapshot/Snapshot.h"

// What a screen reader says, in the language of the environment. Works from snapshots alone. Main thread
// only.
namespace ax::reader {

// One line, without blanks at its ends and without any text twice: label, value, what it is and how it
// stands, hint. Empty for a node that has nothing to say.
std::string spokenLine(const Node& node);

// The screen's title, then a line for each element in reading order, and for a chart with a name that holds
// none. What covers the rest of the screen says so with its first element.
std::vector<std::string> transcript(const Snapshot& snapshot, const std::string& title);

}  // namespace ax::reader
