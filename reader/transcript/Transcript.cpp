#include "reader/transcript/Transcript.h"

#include <utility>

#include "reader/speech/SpokenLine.h"
#include "reader/text/ReaderStrings.h"

namespace ax::reader {

std::vector<SpokenNode> spokenNodes(const Snapshot& snapshot) {
  std::vector<SpokenNode> spoken;
  bool isModalAhead = false;
  for (Node node : snapshot.nodes()) {
    isModalAhead |= node.states.modal;
    if (!isSpoken(snapshot, node)) continue;
    node.states.modal = std::exchange(isModalAhead, false);
    std::string line = spokenLine(node);
    if (!line.empty()) spoken.push_back({node.id, std::move(line), node.states.modal});
  }
  return spoken;
}

std::vector<std::string> transcript(const Snapshot& snapshot, const std::string& title) {
  std::vector<std::string> lines = {title.empty() ? readerText("screen.untitled")
                                                  : readerText("screen.title", {onOneLine(title)})};
  for (SpokenNode& spoken : spokenNodes(snapshot)) lines.push_back(std::move(spoken.line));
  if (lines.size() == 1) lines.push_back(readerText("screen.empty"));
  return lines;
}

}  // namespace ax::reader
