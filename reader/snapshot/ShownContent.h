#pragma once

#include <string>
#include <unordered_set>
#include <vector>

#include "platform/runtime/Message.h"
#include "reader/snapshot/Snapshot.h"

namespace ax::reader {

// A text that the host draws, whether an element speaks it or not.
struct ShownText {
  std::string text;
  std::string spoken;  // the form in which the text itself asks to be spoken; often the same
  Rect frame;          // in screen space
  std::string className;
  std::string objectId;  // may be empty
};

// What somebody sees of a screen beside its elements. Plain values; they outlive the objects.
struct ShownContent {
  Rect area;                               // of the screen itself, in screen space
  std::vector<ShownText> texts;            // visible ones, in the host's view order
  std::unordered_set<NodeId> scrollable;   // nodes of the snapshot that lie in a scroll view
  std::unordered_set<NodeId> fromTheLeft;  // nodes whose views stay the same way around in every language
};

// Asks the live objects behind a snapshot, which must be the newest of the screen. Where a modal view covers
// the screen, only what that one shows counts. What the host raises counts as nothing. Main thread only.
ShownContent readShownContent(const Snapshot& snapshot, Receiver screen, const ObjectNames& names = nullptr);

}  // namespace ax::reader
