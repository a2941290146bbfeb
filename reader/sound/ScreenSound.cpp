#include "reader/sound/ScreenSound.h"

#include <vector>

#include "platform/formatting/Region.h"
#include "reader/sound/ChartSound.h"
#include "reader/sound/Speech.h"
#include "reader/transcript/Transcript.h"

namespace ax::reader {

namespace {

constexpr double breath = 0.5;  // seconds
constexpr double pauseAfterChart = 1;

// A line, or a chart where the text is empty.
struct Piece {
  NodeId node;
  std::string text;
};

std::vector<Piece> piecesOf(const Snapshot& snapshot, const std::string& title) {
  const std::vector<SpokenNode> spoken = spokenNodes(snapshot);
  std::vector<Piece> pieces;
  const std::vector<std::string> lines = transcript(snapshot, title);
  for (std::size_t i = 0; i + spoken.size() < lines.size(); ++i) pieces.push_back({0, lines[i]});
  auto next = spoken.begin();
  for (const Node& node : snapshot.nodes()) {
    for (; next != spoken.end() && next->node == node.id; ++next) pieces.push_back({node.id, next->line});
    if (node.series) pieces.push_back({node.id, ""});
  }
  return pieces;
}

Sound soundOf(const Snapshot& snapshot, const Piece& piece) {
  Sound sound;
  if (piece.text.empty()) {
    sound = chartSound(snapshot, *snapshot.node(piece.node));
    sound.addSilence(pauseAfterChart);
  } else if (const auto spoken = spokenSound(piece.text, formatting::currentRegion().locale)) {
    sound = *spoken;
    sound.addSilence(breath);
  }
  return sound;
}

}  // namespace

void soundScreen(const Snapshot& snapshot, const std::string& title, const ScreenSoundPiece& take) {
  const std::vector<Piece> pieces = piecesOf(snapshot, title);
  for (std::size_t i = 0; i < pieces.size(); ++i) take(soundOf(snapshot, pieces[i]), i, pieces.size());
}

}  // namespace ax::reader
