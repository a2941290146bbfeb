#pragma once

#include <string>

#include "reader/picture/Markup.h"
#include "reader/snapshot/Node.h"

namespace ax::reader {

// What a node is called: its label, else the name of its data series, with times in words; may be
// empty.
std::string nameOf(const Node& node);

// Writes one element: what it is, its name, value, state and hint. `id` is free for it on the page.
void addElementLine(Markup& html, const Node& node, const std::string& id, int headingLevel);

// Writes what there is of the states that no attribute of the element tells.
void addStateWords(Markup& html, const Node& node);

}  // namespace ax::reader
