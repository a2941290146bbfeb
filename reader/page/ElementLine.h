#pragma once

#include <string>

#include "reader/picture/Markup.h"
#include "reader/snapshot/Node.h"

namespace ax::reader {

// What a node is called: its label, else the name of its data series; may be empty.
std::string nameOf(const Node& node);

// What a chart is called in its figure; never empty.
std::string captionOf(const Node& chart);

// Writes one element: what it is, its name, value, state and hint. `id` is free for it on the page.
void addElementLine(Markup& html, const Node& node, const std::string& id, int headingLevel);

// Writes what there is of the states that no attribute of the element tells.
void addStateWords(Markup& html, const Node& node);

}  // namespace ax::reader
