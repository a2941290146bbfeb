#include <sndfile.h>

#include "tests/apps/ProgramTest.h"
#include "tests/reader/Hearing.h"

namespace ax::app {

namespace {

using reader::testing::hear;
using reader::testing::Heard;
using reader::testing::heightOfPitch;

constexpr double noteSeconds = 0.2;

// A trend of five periods: 10, none, 0, 40 and 30 kilometers.
constexpr const char* trend = R"({"format": "axvelto-scene/1", "title": "Trend",
  "environment": {"locale": "en_US", "now": "2026-06-18T21:15:00"},
  "screen": {"class": "View", "set": {"frame": {"rect": [0, 0, 250, 300]}}, "subviews": [
    {"class": "Label", "set": {"frame": {"rect": [0, 0, 200, 20]}, "text": "This is before the chart"}},
    {"class": "Velto.TrendDetailChartView", "id": "chart", "set": {
      "frame": {"rect": [0, 50, 250, 200]}, "accessibilityUnit": {"unit": "km"},
      "titleLabel": {"class": "Label", "set": {"frame": {"rect": [0, 0, 200, 20]}, "text": "Distance"}},
      "barStops": [-50, 0, 50, 100, 150],
      "bars": [
        {"class": "Velto.TrendBar", "set": {"dateInterval": {"interval": ["2026-01-01T00:00:00", "2026-01-31T12:00:00"]}, "quantity": {"quantity": [10, "km"]}}},
        {"class": "Velto.TrendBar", "set": {"dateInterval": {"interval": ["2026-02-01T00:00:00", "2026-02-28T12:00:00"]}}},
        {"class": "Velto.TrendBar", "set": {"dateInterval": {"interval": ["2026-03-01T00:00:00", "2026-03-31T12:00:00"]}, "quantity": {"quantity": [0, "km"]}}},
        {"class": "Velto.TrendBar", "set": {"dateInterval": {"interval": ["2026-04-01T00:00:00", "2026-04-30T12:00:00"]}, "quantity": {"quantity": [40, "km"]}}},
        {"class": "Velto.TrendBar", "set": {"dateInterval": {"interval": ["2026-05-01T00:00:00", "2026-05-31T12:00:00"]}, "quantity": {"quantity": [30, "km"]}}}]}}]}})";

constexpr const char* withoutCharts = R"({"format": "axvelto-scene/1", "title": "T",
  "screen": {"class": "View", "set": {"frame": {"rect": [0, 0, 9, 9]}}}})";

struct Samples {
  std::vector<float> pairs;
  int rate = 0;

  double seconds() const { return double(pairs.size()) / 2 / rate; }
  Heard at(double from, double seconds) const { return hear(pairs, from, from + seconds); }
};

Samples readSound(const std::string& path) {
  SF_INFO info = {};
  SNDFILE* file = sf_open(path.c_str(), SFM_READ, &info);
  EXPECT_NE(file, nullptr) << path;
  EXPECT_EQ(info.channels, 2);
  Samples samples;
  samples.rate = info.samplerate;
  samples.pairs.resize(std::size_t(std::max<sf_count_t>(info.frames, 0)) * 2);
  sf_readf_float(file, samples.pairs.data(), info.frames);
  sf_close(file);
  return samples;
}

std::string bytesOf(const std::string& path) {
  std::ifstream in(path, std::ios::binary);
  return {std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
}

class SoundCommandTest : public ProgramTest {
 protected:
  // The samples of a file that the program makes of a scene.
  Samples made(const std::string& arguments, const std::string& ending, const std::string& scene = trend) {
    const std::string path = file("made" + ending, "");
    const Outcome outcome = run(arguments + " '" + path + "'", scene);
    EXPECT_EQ(outcome.code, 0) << outcome.err;
    EXPECT_EQ(outcome.out, "");
    said = outcome.err;
    bytes = bytesOf(path);
    return readSound(path);
  }

  std::string said, bytes;
};

TEST_F(SoundCommandTest, EndsWithTheNotesOfTheChartAndRestsInItsGaps) {
  const Samples sound = made("sound - -o", ".wav");
  EXPECT_EQ(said, "");
  const double notes = sound.seconds() - 5 * noteSeconds;
  EXPECT_NEAR(sound.at(notes - 1.4, 0.4).pitch, 200, 0.5);
  EXPECT_NEAR(sound.at(notes - 1.0, 0.4).pitch, 1400, 0.5);
  const double heights[] = {0.25, -1, 0, 1, 0.75};  // the bar of 0 is no gap
  for (std::size_t i = 0; i < 5; ++i) {
    const Heard note = sound.at(notes + double(i) * noteSeconds, noteSeconds);
    EXPECT_NEAR(note.pitch == 0 ? -1 : heightOfPitch(note.pitch), heights[i], 0.003) << "note " << i;
    EXPECT_LT(note.peak, 0.6);
  }
  // What is said before is no tone, and comes from the middle.
  const Heard spoken = sound.at(0, notes - 1.5);
  EXPECT_GT(notes - 1.4, 4);
  EXPECT_GT(spoken.level, 0.01);
  EXPECT_LT(spoken.peak, 0.95);
  EXPECT_NEAR(spoken.pan, 0.5, 1e-3);
}

TEST_F(SoundCommandTest, WritesEachFormatTheSameEveryTime) {
  const double seconds = made("sound - --of chart -o", ".wav").seconds();
  for (const char* ending : {".wav", ".flac", ".ogg", ".OPUS"}) {
    const Samples sound = made("sound - -o", ending);
    const std::string first = bytes;
    EXPECT_EQ(sound.rate, 48'000);
    EXPECT_NEAR(sound.seconds(), seconds, 0.02) << ending;
    EXPECT_NEAR(sound.at(seconds - 0.2, 0.2).pitch, 200 * std::pow(7, 0.75), 3) << ending;
    made("sound - -o", ending);
    EXPECT_TRUE(bytes == first) << ending;
  }
  EXPECT_EQ(bytes.substr(0, 4), "OggS");
  EXPECT_NE(bytes.find("OpusHead"), std::string::npos);
}

TEST_F(SoundCommandTest, SpeaksTheTranscriptAndPlaysTheChartWhereItStands) {
  const std::string chartAlone = "sound - -o";
  const double chart = made(chartAlone, ".wav").seconds();
  const Samples sound = made("speak - --audio", ".wav");
  EXPECT_GT(sound.seconds(), chart + 8);
  // The first tone that stands alone is the lower reference; the chart's elements are spoken after its notes.
  double at = 0;
  const auto isTone = [&](double from, double pitch) {
    return std::abs(sound.at(from, 0.1).pitch - pitch) < 1 &&
           std::abs(sound.at(from + 0.1, 0.1).pitch - pitch) < 1 &&
           std::abs(sound.at(from + 0.4, 0.1).pitch - 1400) < 1;
  };
  while (at < sound.seconds() && !isTone(at, 200)) at += 0.05;
  EXPECT_GT(at, chart - 2.4 + 2);  // after the title, the text before it and its own introduction
  EXPECT_GT(sound.at(at + 5, sound.seconds() - at - 5).level, 0.01);
}

TEST_F(SoundCommandTest, PlaysTheTonesAloneWhereNoVoiceReadsTheLanguage) {
  const Samples sound = made("sound - --locale ja_JP -o", ".wav");
  EXPECT_NE(said.find("no voice reads ja_JP"), std::string::npos) << said;
  EXPECT_NEAR(sound.seconds(), 1.4 + 5 * noteSeconds, 0.001);
  EXPECT_NEAR(sound.at(0, 0.4).pitch, 200, 0.5);
  EXPECT_EQ(made("speak - --locale ja_JP --audio", ".wav").at(0, 0.4).pitch, sound.at(0, 0.4).pitch);
}

TEST_F(SoundCommandTest, RefusesWhatItCannotMake) {
  const std::string path = file("kept.wav", "before");
  const auto expect = [&](const std::string& arguments, const char* scene, int code, const char* what) {
    const Outcome outcome = run(arguments, scene);
    EXPECT_EQ(outcome.code, code) << arguments;
    EXPECT_NE(outcome.err.find(what), std::string::npos) << outcome.err;
  };
  expect("sound - -o notes.mp3", trend, 2, ".wav, .flac, .ogg or .opus");
  expect("speak - --audio notes", trend, 2, ".wav, .flac, .ogg or .opus");
  expect("sound -", trend, 2, "-o");
  expect("sound - -o '" + path + "/notes.wav'", trend, 2, "cannot be written");
  expect("sound - --of nothing -o '" + path + "'", trend, 2, "nothing");
  expect("sound - -o '" + path + "'", withoutCharts, 1, "no chart");
  EXPECT_EQ(bytesOf(path), "before");
}

}  // namespace

}  // namespace ax::app
