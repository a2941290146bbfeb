#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <random>

#include "host/core/HostApp.h"
#include "reader/scene/SceneRun.h"
#include "reader/transcript/Transcript.h"
#include "tests/reader/FitWriter.h"
#include "tests/reader/WorkoutPieces.h"
#include "tests/tour/Samples.h"

namespace ax::reader::testing {
namespace {

constexpr double seven = 1772953200;  // 2026-03-08 07:00:00 UTC
constexpr std::int64_t unknown32 = 0x7FFFFFFF;

std::int64_t at(int second) {
  return fitTime(seven + second);
}

std::int64_t angle(double degrees) {
  return static_cast<std::int64_t>(degrees * 4294967296.0 / 360);
}

void defineRecords(FitWriter& file) {
  file.define(
      0, 20,
      {{253, fitU32, 4}, {0, fitS32, 4}, {1, fitS32, 4}, {3, fitU8, 1}, {5, fitU32, 4}, {78, fitU32, 4}}, 3);
}

// A ride of a hundred seconds that stood from 40 to 60, as its records, events, laps and session tell it.
std::string ride(bool isBigEndian, int headerSize) {
  FitWriter file(isBigEndian);
  file.define(1, 0, {{0, fitEnum, 1}, {8, fitText, 8}}).raw(std::string("\1\4Tern 2\0\0", 10));
  file.define(2, 21, {{253, fitU32, 4}, {0, fitEnum, 1}, {1, fitEnum, 1}, {3, fitU32, 1}});
  file.add(2, {at(0), 0, 0, 7});
  defineRecords(file);
  for (int i = 0; i <= 40; i += 10) {
    file.add(0,
             {at(i), angle(50 + i * 1e-5), angle(10), i == 20 ? 255 : 100 + i, i * 500, (500 + 100 + i) * 5});
  }
  file.define(2, 21, {{253, fitU32, 4}, {0, fitEnum, 1}, {1, fitEnum, 1}, {3, fitU32, 1}});
  file.add(2, {at(40), 0, 4, 7}).add(2, {at(60), 0, 0, 7});
  defineRecords(file);
  file.add(0, {at(60), unknown32, unknown32, 150, 20000, 3000})
      .add(0, {at(100), angle(50.001), angle(10), 170, 40000, 3000});
  file.define(3, 19, {{253, fitU32, 4}, {2, fitU32, 4}, {8, fitU32, 4}, {9, fitU32, 4}, {23, fitEnum, 1}});
  file.add(3, {at(40), at(0), 40000, 20000, 0}).add(3, {at(100), at(60), 40500, 20000, 1});
  file.define(4, 18,
              {{253, fitU32, 4},
               {2, fitU32, 4},
               {5, fitEnum, 1},
               {7, fitU32, 4},
               {8, fitU32, 4},
               {9, fitU32, 4},
               {11, fitU16, 2},
               {16, fitU8, 1},
               {17, fitU8, 1},
               {20, fitU16, 2},
               {22, fitU16, 2}});
  file.add(4, {at(100), at(0), 2, 100500, 80500, 40123, 12, 131, 172, 210, 77});
  file.define(5, 34, {{253, fitU32, 4}, {5, fitU32, 4}}).add(5, {at(100), at(100) - 5 * 3600});
  return file.file(headerSize);
}

std::string spoken(const WorkoutActivity& activity, const std::string& locale) {
  host::linkHost();
  const Scene scene = readSceneDocument(workoutScene(activity, {.locale = locale}), "test");
  const SceneRun run(scene, {.modulePath = tour::modulePath()});
  std::string text;
  for (const std::string& line : transcript(takeSnapshot(run.screen()), run.title())) text += line + "\n";
  return text;
}

// 200 meters in a pool of 25, a rest in the middle, by a clock one hour east of UTC.
std::string poolSwim() {
  FitWriter file;
  file.define(0, 20, {{253, fitU32, 4}, {3, fitU8, 1}, {5, fitU32, 4}});
  for (int second = 0; second <= 270; second += 5) {
    const int swum = second < 120 ? second : std::max(120, second - 30);
    file.add(0, {at(second), 112 + swum / 8, swum * 20000 / 240});
  }
  file.define(1, 101, {{253, fitU32, 4}, {2, fitU32, 4}, {4, fitU32, 4}, {7, fitEnum, 1}, {12, fitEnum, 1}});
  constexpr int freestyle = 0, breaststroke = 2, noStroke = 255;
  int begin = 0;
  const auto add = [&](int seconds, int stroke) {
    file.add(1, {at(begin + seconds), at(begin), seconds * 1000, stroke, stroke == noStroke ? 0 : 1});
    begin += seconds;
  };
  for (const int seconds : {28, 30, 30, 32}) add(seconds, freestyle);
  add(30, noStroke);
  for (const int seconds : {29, 30, 30, 31}) add(seconds, breaststroke);
  file.define(2, 18,
              {{253, fitU32, 4},
               {2, fitU32, 4},
               {5, fitEnum, 1},
               {7, fitU32, 4},
               {8, fitU32, 4},
               {9, fitU32, 4},
               {11, fitU16, 2},
               {44, fitU16, 2}});
  file.add(2, {at(270), at(0), 5, 270000, 240000, 20000, 38, 2500});
  file.define(3, 34, {{253, fitU32, 4}, {5, fitU32, 4}}).add(3, {at(270), at(270) + 3600});
  return file.file();
}

// With AXVELTO_WRITE_SAMPLES in the environment it is written anew.
TEST(FitFileTest, IsTheSampleOfThePool) {
  const auto sample = tour::samplesFolder() / "workouts/pool-swim.fit";
  if (std::getenv("AXVELTO_WRITE_SAMPLES") != nullptr) {
    std::ofstream(sample, std::ios::binary) << poolSwim();
  }
  EXPECT_TRUE(tour::fileText(sample) == poolSwim());
}

TEST(WorkoutSceneTest, RoundsADistanceOnceWhenItIsSpoken) {
  WorkoutActivity activity = fileOf(ride(false, 14)).activities.at(0);
  const std::pair<double, const char*> distances[] = {
      {15964.9, "Distance, Total, 15.96 k"}, {15964.999, "15.96 k"}, {15965, "Distance, Total, 15.97 k"}};
  for (const auto& [metres, expected] : distances) {
    activity.metres = metres;
    EXPECT_NE(spoken(activity, "en_AU").find(expected), std::string::npos) << metres;
  }
}

TEST(FitFileTest, TellsASessionInEitherByteOrder) {
  for (const bool isBigEndian : {false, true}) {
    const WorkoutFile file = fileOf(ride(isBigEndian, isBigEndian ? 12 : 14));
    ASSERT_EQ(file.activities.size(), 1U);
    const WorkoutActivity& activity = file.activities.front();
    EXPECT_EQ(activity.sport, "cycling");
    EXPECT_EQ(activity.sourceName, "Tern 2");
    EXPECT_EQ(activity.start, seven);
    EXPECT_EQ(activity.duration, 100.5);
    EXPECT_EQ(activity.activeSeconds, 80.5);
    EXPECT_EQ(activity.metres, 401.23);
    EXPECT_EQ(activity.measures.kilocalories, 12);
    EXPECT_EQ(activity.measures.averageHeartRate, 131) << "its own, not that of the records";
    EXPECT_EQ(activity.measures.maximumHeartRate, 172);
    EXPECT_EQ(activity.measures.averagePower, 210);
    EXPECT_EQ(activity.measures.elevationGain, 77);
    EXPECT_EQ(activity.secondsEastOfUtc, -5 * 3600);
    ASSERT_EQ(activity.points.size(), 7U);
    EXPECT_NEAR(activity.points[4].latitude.value_or(0), 50.0004, 1e-6);
    EXPECT_EQ(activity.points[2].heartRate, std::nullopt);
    EXPECT_EQ(activity.points[4].altitude, 140.0F);
    EXPECT_EQ(activity.points[5].latitude, std::nullopt);
    EXPECT_EQ(activity.points[6].distance, 400);
    ASSERT_EQ(activity.segments.size(), 2U) << "the timer stood once";
    EXPECT_EQ(activity.segments[1].first, 5U);
    ASSERT_EQ(activity.laps.size(), 2U);
    EXPECT_EQ(activity.laps[1].seconds, 40.5);
    EXPECT_FALSE(activity.laps[0].isRest);
    EXPECT_TRUE(activity.laps[1].isRest);
  }
}

TEST(FitFileTest, WorksFiguresOutWhereNoSessionTellsThem) {
  FitWriter file;
  defineRecords(file);
  // The time goes on by compressed headers, over the end of their five bits.
  file.add(0, {at(0), angle(50), angle(10), 100, 0xFFFFFFFF, 0xFFFFFFFF});
  file.define(1, 20, {{3, fitU8, 1}, {5, fitU32, 4}});
  const auto start = static_cast<unsigned>(at(0));
  for (unsigned second = 20; second <= 80; second += 20) file.addAt(1, start + second, {120, second * 300});
  const WorkoutActivity run = fileOf(file.file()).activities.at(0);
  EXPECT_EQ(run.duration, 80);
  EXPECT_EQ(run.activeSeconds, 80);
  EXPECT_EQ(run.metres, 240);
  EXPECT_NEAR(run.measures.averageHeartRate.value_or(0), 117.5, 1e-9);
  EXPECT_EQ(run.measures.maximumHeartRate, 120);
}

// A swim, a change of clothes and a ride, in one file; distances count on.
TEST(FitFileTest, MakesAWorkoutOfEachSession) {
  FitWriter file;
  file.define(0, 20, {{253, fitU32, 4}, {3, fitU8, 1}, {5, fitU32, 4}});
  for (int second = 0; second < 300; second += 10)
    file.add(0, {at(second), 100 + second / 100, second * 100});
  file.define(1, 101, {{253, fitU32, 4}, {2, fitU32, 4}, {4, fitU32, 4}, {7, fitEnum, 1}, {12, fitEnum, 1}});
  file.add(1, {at(30), at(0), 30000, 2, 1})
      .add(1, {at(60), at(30), 20000, 255, 0})
      .add(1, {at(99), at(60), 35000, 0, 1});
  file.define(
      2, 18,
      {{253, fitU32, 4}, {2, fitU32, 4}, {5, fitEnum, 1}, {8, fitU32, 4}, {9, fitU32, 4}, {44, fitU16, 2}});
  file.add(2, {at(100), at(0), 5, 100000, 5000, 2500}).add(2, {at(120), at(100), 3, 20000, 0, 0xFFFF});
  file.add(2, {at(300), at(120), 2, 180000, 30000, 0xFFFF});
  const WorkoutFile triathlon = fileOf(file.file());
  ASSERT_EQ(triathlon.activities.size(), 2U);
  const WorkoutActivity& swim = triathlon.activities[0];
  EXPECT_EQ(swim.sport, "swimming");
  EXPECT_EQ(swim.poolMetres, 25);
  EXPECT_EQ(swim.points.size(), 10U);
  EXPECT_EQ(swim.measures.maximumHeartRate, 100);
  ASSERT_EQ(swim.lengths.size(), 3U);
  EXPECT_EQ(swim.lengths[0].stroke, "breaststroke");
  EXPECT_TRUE(swim.lengths[1].isRest);
  EXPECT_EQ(triathlon.activities[1].sport, "cycling");
  EXPECT_EQ(triathlon.activities[1].start, seven + 120);
  EXPECT_EQ(triathlon.activities[1].points.size(), 18U);

  const std::string text = spoken(swim, "en_US");
  EXPECT_NE(text.find("Length 1, breaststroke, 25 meters, 2 minutes per 100 meters"), std::string::npos)
      << text;
  EXPECT_NE(text.find("\nRest, 20 seconds\nLength 2, "), std::string::npos) << text;
}

struct DamageCase {
  std::string bytes, what, place;
};

TEST(FitFileTest, TellsDamageAndItsPlace) {
  const std::string whole = ride(false, 14);
  std::string flipped = whole;
  flipped[whole.size() - 20] ^= 1;
  std::string header = whole;
  header[4] ^= 1;
  const DamageCase cases[] = {
      {whole.substr(0, 300), "the file is cut off", "byte 300"},
      {flipped, "the checksum does not match", "byte " + std::to_string(whole.size() - 2)},
      {header, "the checksum of the header does not match", "byte 12"},
      {whole + "rubbish", "something stands behind the FIT data", "byte " + std::to_string(whole.size())},
      {FitWriter().raw("\x07").file(), "a message of a kind that has not been defined", "byte 14"},
      {FitWriter().define(0, 20, {{253, fitU32, 4}}).raw(std::string(2, '\0')).file(),
       "a message reaches beyond the end of the data", "byte 24"},
      {FitWriter().file(), "a FIT file without a workout", "byte 0"},
  };
  for (const DamageCase& each : cases) {
    const WorkoutFileResult result = readWorkoutFile(each.bytes, "a.fit");
    const auto* fault = std::get_if<WorkoutFileFault>(&result);
    ASSERT_TRUE(fault) << each.what;
    EXPECT_EQ(fault->what, each.what);
    EXPECT_EQ(fault->place, each.place) << each.what;
    EXPECT_EQ(fault->file, "a.fit");
  }
  const WorkoutFileResult result = readWorkoutFile(whole.substr(0, 300), "a.fit", {.readsDamaged = true});
  const auto* partial = std::get_if<WorkoutFile>(&result);
  ASSERT_TRUE(partial);
  EXPECT_FALSE(partial->activities.at(0).points.empty());
  EXPECT_EQ(partial->damage.value_or(WorkoutFileFault{}).place, "byte 300");
}

TEST(FitFileTest, ReadsChainedFilesOneAfterTheOther) {
  const WorkoutFile both = fileOf(ride(false, 14) + ride(true, 12));
  ASSERT_EQ(both.activities.size(), 2U);
  EXPECT_EQ(both.activities[1].metres, 401.23);
}

// Whatever bytes change, the reader answers, and with figures that can be.
TEST(FitFileTest, HoldsAgainstAnyBytes) {
  const std::string whole = ride(false, 12);
  std::mt19937 random(20261123);
  for (int run = 0; run < 3000; ++run) {
    std::string bytes = whole.substr(0, 13 + random() % (whole.size() - 12));
    for (int i = random() % 6; i >= 0; --i)
      bytes[12 + random() % std::max<std::size_t>(1, bytes.size() - 12)] = static_cast<char>(random());
    const WorkoutFileResult result = readWorkoutFile(bytes, "any", {.readsDamaged = run % 2 == 0});
    const auto* file = std::get_if<WorkoutFile>(&result);
    for (const WorkoutActivity& each : file != nullptr ? file->activities : std::vector<WorkoutActivity>()) {
      EXPECT_GE(each.duration, 0);
      EXPECT_GE(each.activeSeconds, 0);
      EXPECT_TRUE(std::isfinite(each.metres));
      if (run % 50 == 0) workoutScene(each);
    }
  }
}

}  // namespace
}  // namespace ax::reader::testing
