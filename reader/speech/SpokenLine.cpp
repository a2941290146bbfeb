#include "reader/speech/SpokenLine.h"

#include <algorithm>
#include <string_view>
#include <vector>

#include "platform/formatting/Lists.h"
#include "reader/snapshot/Charts.h"
#include "reader/speech/SpokenTime.h"
#include "reader/text/ReaderStrings.h"

namespace ax::reader {

namespace {

struct TraitWord {
  Traits trait;
  std::string_view key;
};

// Static text has no word: it is what is expected.
constexpr TraitWord traitWords[] = {{TraitHeader, "role.header"},
                                    {TraitButton, "role.button"},
                                    {TraitLink, "role.link"},
                                    {TraitImage, "role.image"},
                                    {TraitAdjustable, "role.adjustable"},
                                    {TraitSelected, "state.selected"},
                                    {TraitNotEnabled, "state.disabled"}};

class SpokenPieces {
 public:
  void add(const std::optional<AttributedText>& text) {
    if (text) add(onOneLine(withSpokenTimes(*text)));
  }
  void add(std::string piece) {
    if (!piece.empty() && !isSaid(piece)) pieces_.push_back(std::move(piece));
  }
  std::string line() const { return joined(pieces_); }

 private:
  // Whether a piece, or whole parts of one, say the same.
  bool isSaid(const std::string& piece) const {
    const std::string separator(formatting::listSeparator());
    const std::string part = separator + piece + separator;
    return std::ranges::any_of(pieces_, [&](const std::string& said) {
      return (separator + said + separator).find(part) != std::string::npos;
    });
  }

  std::vector<std::string> pieces_;
};

void addStates(const Node& node, SpokenPieces& pieces) {
  for (const TraitWord& word : traitWords) {
    if ((node.traits & word.trait) != 0) pieces.add(readerText(word.key));
  }
  if (node.series) pieces.add(readerText("role.chart"));
  if (node.states.expanded) pieces.add(readerText("state.expanded"));
  if (node.states.collapsed) pieces.add(readerText("state.collapsed"));
  if (node.states.modal) pieces.add(readerText("state.modal"));
}

}  // namespace

std::string onOneLine(const std::string& text) {
  std::string line;
  for (std::size_t i = 0; i < text.size();) {
    const std::size_t end = std::min(text.find_first_not_of(" \t\r\n", i), text.size());
    if (end == i) {
      line += text[i++];
      continue;
    }
    const std::string_view blank = std::string_view(text).substr(i, end - i);
    const bool isBreak = blank.find_first_of("\r\n") != blank.npos;
    if (!line.empty() && end < text.size()) line += isBreak ? formatting::listSeparator() : " ";
    i = end;
  }
  return line;
}

bool isSpoken(const Snapshot& snapshot, const Node& node) {
  const bool isNamedChart = node.series && (node.label || node.series->name);
  return node.isElement || (isNamedChart && elementsOfChart(snapshot, node).empty());
}

std::string spokenLine(const Node& node) {
  SpokenPieces pieces;
  pieces.add(node.label);
  if (node.series && !node.label) pieces.add(node.series->name);
  pieces.add(node.value);
  addStates(node, pieces);
  pieces.add(node.hint);
  return pieces.line();
}

}  // namespace ax::reader
