#pragma once

#include <string>

#include "reader/picture/Markup.h"
#include "reader/picture/ReadingOrder.h"

namespace ax::reader {

struct PlaceOnPage {
  std::string id;    // of the screen's section; what stands in it begins its own ids so
  int headingLevel;  // of the headings of the screen
  bool hasSound;     // whether charts get a player
};

// Writes what a listener meets on a screen as an ordered list, with the numbers of the reading order.
// Containers are groups, charts figures. Texts stand as the screen gives them.
void addElementList(Markup& html, const Snapshot& snapshot, const ReadingOrder& order,
                    const PlaceOnPage& place);

}  // namespace ax::reader
