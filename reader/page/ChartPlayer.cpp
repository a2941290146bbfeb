#include "reader/page/ChartPlayer.h"

#include "reader/page/ChartFigure.h"
#include "reader/sound/ChartSound.h"
#include "reader/sound/SoundFile.h"
#include "reader/text/ReaderStrings.h"

namespace ax::reader {

namespace {

std::string base64(std::string_view bytes) {
  constexpr char digits[] = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
  constexpr std::size_t group = 3;
  std::string text;
  text.reserve((bytes.size() / group + 1) * 4);
  for (std::size_t i = 0; i < bytes.size(); i += group) {
    std::uint32_t bits = 0;
    for (std::size_t j = i; j < i + group; ++j) {
      bits = bits << 8 | (j < bytes.size() ? std::uint8_t(bytes[j]) : 0u);
    }
    for (int shift = 18; shift >= 0; shift -= 6) text += digits[bits >> shift & 63];
  }
  for (std::size_t left = (group - bytes.size() % group) % group; left > 0; --left) {
    text[text.size() - left] = '=';
  }
  return text;
}

}  // namespace

void addChartPlayer(Markup& html, const Snapshot& snapshot, const Node& chart) {
  if (notesSound(snapshot, chart).pairs() == 0) return;
  const std::string file = soundFileOf(chartSound(snapshot, chart), SoundFormat::opus);
  html.open("audio", {{"controls", true},
                      {"preload", "metadata"},
                      {"aria-label", readerText("page.sound", {captionOf(snapshot, chart)})},
                      {"src", "data:audio/ogg;codecs=opus;base64," + base64(file)}});
  html.close();
}

}  // namespace ax::reader
