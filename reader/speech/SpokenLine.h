#pragma once

#include <string>

#include "reader/snapshot/Snapshot.h"

// What a screen reader says of one element, in the language of the environment. Main thread only.
namespace ax::reader {

// Whether a listener steps to the node: to elements, and to charts with a name that hold none, which would
// pass unheard otherwise.
bool isSpoken(const Snapshot& snapshot, const Node& node);

// One line, without blanks at its ends and without any text twice: label, value, what it is and how it
// stands, hint. Empty for a node that has nothing to say.
std::string spokenLine(const Node& node);

// Line breaks become pauses, runs of blanks one blank; none is left at the ends.
std::string onOneLine(const std::string& text);

}  // namespace ax::reader
