#include "reader/sound/ChartSound.h"

#include <algorithm>

#include "platform/formatting/Region.h"
#include "reader/graph/ChartDescription.h"
#include "reader/sound/ChartNotes.h"
#include "reader/sound/Speech.h"
#include "reader/sound/Tone.h"
#include "reader/speech/ChartWords.h"
#include "reader/speech/SpokenTime.h"
#include "reader/text/ReaderStrings.h"

namespace ax::reader {

namespace {

using Lines = std::vector<std::string>;

constexpr double middle = 0.5;
constexpr double referenceSeconds = 0.4;
constexpr double pauseAfterLine = 0.3;
constexpr double pauseAfterReferences = 0.6;

std::string counted(std::string_view key, std::size_t count) {
  return readerText(key, {std::int64_t(count)});
}

// What it calls its ends, else their figures.
std::string horizontalLine(const DataSeriesAxis& axis) {
  const auto& places = axis.positions;
  const bool isDescribed = places.size() > 1 && places.front().position == 0 && places.back().position == 1;
  const std::string range = isDescribed ? readerText("chart.range", {withSpokenTimes(places.front().text),
                                                                     withSpokenTimes(places.back().text)})
                                        : rangeOf(axis.minimum, axis.maximum);
  return readerText(
      "chart.axis.x",
      {joined({withSpokenTimes(axis.title), isDescribed ? std::string() : unitOf(axis), range})});
}

std::string verticalLine(const DataSeriesAxis& axis, const ChartNotes& notes) {
  return readerText(
      "chart.axis.y",
      {joined({withSpokenTimes(axis.title), unitOf(axis), rangeOf(notes.minimum, notes.maximum)})});
}

Lines sliceLines(const DataSeries& series, const ChartNotes& notes) {
  const DataSlice &first = series.slices.front(), &last = series.slices.back();
  const std::string span = spokenSpan({first.start, last.end, {}, first.startTime, last.endTime});
  return {joined({counted("chart.slices", series.slices.size()), readerText("sound.slices"), span}),
          readerText("chart.axis.y", {rangeOf(notes.minimum, notes.maximum)})};
}

Lines linesOf(const Snapshot& snapshot, const Node& chart, const ChartNotes& notes) {
  const DataSeries& series = *chart.series;
  Lines lines = {headingOf(snapshot, chart)};
  if (notes.notes.empty()) {
    lines.push_back(readerText("chart.no.data"));
  } else if (playsSlices(series)) {
    for (std::string& line : sliceLines(series, notes)) lines.push_back(std::move(line));
  } else {
    lines.push_back(horizontalLine(series.axes[horizontalAxis]));
    lines.push_back(verticalLine(series.axes[verticalAxis], notes));
  }
  if (notes.averaged > 0) {
    const std::string_view key = playsSlices(series) ? "chart.slices" : "chart.values";
    lines.push_back(joined({counted(key, notes.averaged), counted("sound.averaged", mostNotes)}));
  }
  return lines;
}

Sound soundOf(const ChartNotes& notes) {
  Sound sound;
  if (notes.notes.empty()) return sound;
  for (const double pitch : {lowestPitch, highestPitch}) sound.add(note(pitch, middle, referenceSeconds));
  sound.addSilence(pauseAfterReferences);
  for (const auto& [value, place] : notes.notes) {
    if (value) {
      sound.add(note(pitchOf(notes.heightOf(*value)), place));
    } else {
      sound.addSilence(noteSeconds);
    }
  }
  return sound;
}

}  // namespace

Lines introductionOfChart(const Snapshot& snapshot, const Node& chart) {
  return linesOf(snapshot, chart, notesOfChart(snapshot, chart));
}

Sound notesSound(const Snapshot& snapshot, const Node& chart) {
  return soundOf(notesOfChart(snapshot, chart));
}

Sound chartSound(const Snapshot& snapshot, const Node& chart) {
  const ChartNotes notes = notesOfChart(snapshot, chart);
  Sound sound;
  for (const std::string& line : linesOf(snapshot, chart, notes)) {
    const std::optional<Sound> spoken = spokenSound(line, formatting::currentRegion().locale);
    if (!spoken) break;
    sound.add(*spoken);
    sound.addSilence(pauseAfterLine);
  }
  sound.add(soundOf(notes));
  return sound;
}

}  // namespace ax::reader
