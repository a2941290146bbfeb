#include <gtest/gtest.h>

#include <limits>

#include "platform/formatting/Durations.h"
#include "platform/foundation/Array.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Number.h"
#include "platform/toolkit/DataSeriesMessages.h"
#include "reader/snapshot/Charts.h"
#include "reader/sound/ChartSound.h"
#include "reader/sound/Tone.h"
#include "tests/formatting/RegionScope.h"
#include "tests/reader/Hearing.h"
#include "tests/reader/ScreenPieces.h"

namespace ax::reader::testing {

namespace {

using Numbers = std::vector<double>;
using Texts = std::vector<std::string>;

constexpr double gap = std::numeric_limits<double>::quiet_NaN();
constexpr double notesBegin = 1.4;  // after the two reference tones and a pause

Ref<Array> numbers(const Numbers& values) {
  Array::Items items;
  for (const double value : values) items.push_back(number(value));
  return array(std::move(items));
}

// A chart of any points, its vertical axis from 60 to 180 unless it tells none.
class Points : public View {
 public:
  using T = Points;
  static Class& staticClass() {
    static Class& result = ClassBuilder<T>("SoundTestPoints", View::staticClass())
                               .method<&T::containerType>("accessibilityContainerType")
                               .method<&T::values>("_accessibilityDataSeriesValuesForAxis:")
                               .method<&T::minimum>("_accessibilityDataSeriesMinimumValueForAxis:")
                               .method<&T::maximum>("_accessibilityDataSeriesMaximumValueForAxis:")
                               .build();
    return result;
  }
  std::int64_t containerType() { return messages::dataSeriesContainerType; }
  Ref<Array> values(std::int64_t axis) { return numbers(axis == horizontalAxis ? x : y); }
  Ref<Number> minimum(std::int64_t axis) { return axis == verticalAxis && hasRange ? number(60) : nullptr; }
  Ref<Number> maximum(std::int64_t axis) { return axis == verticalAxis && hasRange ? number(180) : nullptr; }

  Numbers x, y;
  bool hasRange = true;
};

class SlicedDay : public View {
 public:
  using T = SlicedDay;
  static Class& staticClass() {
    static Class& result = ClassBuilder<T>("SoundTestSlicedDay", View::staticClass())
                               .method<&T::usesSlices>("_accessibilityShouldUseSlices")
                               .method<&T::count>("_accessibilityNumberOfSlices")
                               .method<&T::seconds>("_accessibilityTimeIntervalPerSlice")
                               .method<&T::quantity>("_accessibilityQuantityForSliceAtIndex:")
                               .build();
    return result;
  }
  bool usesSlices() { return true; }
  std::uint64_t count() { return texts.size(); }
  double seconds() { return 10800; }
  Ref<String> quantity(std::uint64_t index) { return texts[index].empty() ? nullptr : string(texts[index]); }

  Texts texts;
};

Sound soundOf(const Ref<View>& view) {
  const Snapshot snapshot = takeSnapshot(view);
  return notesSound(snapshot, *charts(snapshot).at(0));
}

Ref<Points> chartOf(Numbers x, Numbers y) {
  const Ref<Points> chart = view<Points>({}, {0, 0, 300, 100});
  chart->x = std::move(x);
  chart->y = std::move(y);
  return chart;
}

std::vector<Heard> notesIn(const Sound& sound) {
  std::vector<Heard> notes;
  for (double at = notesBegin; at < sound.seconds() - noteSeconds / 2; at += noteSeconds) {
    notes.push_back(hear(sound.samples(), at, at + noteSeconds));
  }
  return notes;
}

// How high each note is, from 0 to 1; -1 for a rest.
Numbers heightsIn(const Sound& sound) {
  Numbers heights;
  for (const Heard& note : notesIn(sound))
    heights.push_back(note.pitch == 0 ? -1 : heightOfPitch(note.pitch));
  return heights;
}

void expectHeights(const Ref<View>& chart, const Numbers& expected) {
  const Numbers heights = heightsIn(soundOf(chart));
  ASSERT_EQ(heights.size(), expected.size());
  for (std::size_t i = 0; i < heights.size(); ++i)
    EXPECT_NEAR(heights[i], expected[i], 0.002) << "note " << i;
}

TEST(ChartSoundTest, PlaysItsRangeAndThenEachValueFromLeftToRight) {
  const Ref<Points> chart = chartOf({0, 1, 2, 3, 4}, {60, 90, gap, 180, 240});
  const Sound sound = soundOf(chart);
  EXPECT_NEAR(sound.seconds(), notesBegin + 5 * noteSeconds, 1e-4);
  EXPECT_NEAR(hear(sound.samples(), 0, 0.4).pitch, 200, 0.3);
  EXPECT_NEAR(hear(sound.samples(), 0.4, 0.8).pitch, 1400, 0.3);
  EXPECT_EQ(hear(sound.samples(), 0.8, notesBegin).peak, 0);
  expectHeights(chart, {0, 0.25, -1, 1, 1});  // the last lies beyond the axis
  const std::vector<Heard> notes = notesIn(sound);
  for (const std::size_t i : {0, 1, 3, 4}) EXPECT_NEAR(notes[i].pan, double(i) / 4, 0.001) << i;
}

TEST(ChartSoundTest, TakesTheRangeOfItsValuesWhereItTellsNone) {
  const Ref<Points> chart = chartOf({0, 1, 2}, {10, 30, 20});
  chart->hasRange = false;
  expectHeights(chart, {0, 1, 0.5});
  chart->y = {7, 7, 7};
  expectHeights(chart, {0, 0, 0});
  chart->x = chart->y = {};
  EXPECT_EQ(soundOf(chart).pairs(), 0u);
}

TEST(ChartSoundTest, RestsWhereValuesOfARegularStepAreLeftOut) {
  expectHeights(chartOf({0, 1, 2, 5, 6, 7, 8, 9}, {60, 60, 60, 180, 180, 180, 180, 180}),
                {0, 0, 0, -1, -1, 1, 1, 1, 1, 1});
  // Two readings a day keep no step.
  expectHeights(chartOf({0, 0.1, 1, 1.1, 2, 2.1}, {60, 180, 60, 180, 60, 180}), {0, 1, 0, 1, 0, 1});
  // Places that do not match the values are none.
  expectHeights(chartOf({0, 5}, {60, 180, 60}), {0, 1, 0});
}

TEST(ChartSoundTest, AveragesManyValuesInColumnsOfEqualTime) {
  // A reading a second for ten minutes: five a column higher for a while, one minute without any.
  Numbers x, y;
  for (int second = 0; second <= 600; ++second) {
    if (second >= 300 && second < 360) continue;
    x.push_back(second);
    y.push_back(second < 100 ? (second % 2 == 0 ? 60 : 120) : 180);
  }
  const Ref<Points> chart = chartOf(x, y);
  Numbers expected(60, 1);
  for (std::size_t i = 0; i < 10; ++i) expected[i] = 0.25;
  for (std::size_t i = 30; i < 36; ++i) expected[i] = -1;
  expectHeights(chart, expected);
  const Snapshot snapshot = takeSnapshot(chart);
  EXPECT_EQ(introductionOfChart(snapshot, *charts(snapshot)[0]).back(),
            "541 values, averaged into 60 columns");

  chart->x.resize(60);
  chart->y.resize(60);
  EXPECT_EQ(heightsIn(soundOf(chart)).size(), 60u);
  const Snapshot few = takeSnapshot(chart);
  EXPECT_EQ(introductionOfChart(few, *charts(few)[0]),
            (Texts{"Chart without a title", "Horizontal axis: ", "Vertical axis: from 60 to 180"}));
}

TEST(ChartSoundTest, PlaysTheLowAndTheHighOfEachSlice) {
  const Ref<SlicedDay> day = view<SlicedDay>({});
  day->texts = {"100 to 150 beats per minute", "", "200 beats per minute"};
  expectHeights(day, {0, 0.5, -1, -1, 1, 1});
  const Snapshot snapshot = takeSnapshot(day);
  EXPECT_EQ(introductionOfChart(snapshot, *charts(snapshot)[0]),
            (Texts{"Chart without a title",
                   "3 slices, the lowest and the highest value of each, from 0 minutes to 9 hours",
                   "Vertical axis: from 100 to 200"}));
}

TEST(ChartSoundTest, CountsLengthsOfTimeInMinutesInEachLanguage) {
  const Ref<SlicedDay> day = view<SlicedDay>({});
  day->texts = {"0 minutes", "45 minutes", "1 hour, 15 minutes", "2 hours", "3 hours"};
  const Numbers heights = {0, 0, 0.25, 0.25, 75 / 180.0, 75 / 180.0, 120 / 180.0, 120 / 180.0, 1, 1};
  expectHeights(day, heights);
  const RegionScope arabic("ar_EG");
  day->texts = {"٠ دقيقة", "٤٥ دقيقة", formatting::spokenDuration(75 * 60), "ساعتان", "٣ ساعات"};
  expectHeights(day, heights);
  day->texts = {"من ١٬٠٠٠ إلى ٢٬٠٠٠ سعرة حرارية", "١٬٥٠٠ سعرة"};
  expectHeights(day, {0, 1, 0.5, 0.5});
}

TEST(ChartSoundTest, IsAsLoudAtEveryPitchAndNeverClips) {
  const auto decibels = [](double pitch) {
    const Sound sound = note(pitch, 0.5);
    return 20 * std::log10(hear(sound.samples(), 0, noteSeconds).level);
  };
  // What the standard's table of weights has for these pitches.
  EXPECT_NEAR(decibels(200) - decibels(1000), 10.9, 0.2);
  EXPECT_NEAR(decibels(500) - decibels(1000), 3.2, 0.2);
  EXPECT_NEAR(decibels(250) - decibels(400), 3.8, 0.2);
  for (const double pan : {-1.0, 0.0, 0.5, 1.0, 2.0}) {
    const Heard heard = hear(note(200, pan).samples(), 0, noteSeconds);
    EXPECT_NEAR(heard.pan, std::clamp(pan, 0.0, 1.0), 1e-3);
    EXPECT_LT(heard.peak, 0.6);
    EXPECT_NEAR(heard.level, hear(note(200, 0).samples(), 0, noteSeconds).level, 1e-4);
  }
}

TEST(ChartSoundTest, BeginsAndEndsNotesSoftly) {
  const Sound sound = note(1400, 0);
  const double end = sound.seconds();
  const double full = hear(sound.samples(), 0.05, 0.15).peak;
  for (const double at : {0.0, end - 0.001})
    EXPECT_LT(hear(sound.samples(), at, at + 0.001).peak, full * 0.03);
  for (const double at : {0.004, end - 0.006}) {  // halfway
    EXPECT_NEAR(hear(sound.samples(), at, at + 0.002).peak, full * 0.55, full * 0.12);
  }
  EXPECT_NEAR(hear(sound.samples(), 0.01, 0.02).peak, full, full * 0.01);
}

}  // namespace

}  // namespace ax::reader::testing
