#include <gtest/gtest.h>

#include <random>

#include "host/core/HostApp.h"
#include "reader/importers/WorkoutScene.h"
#include "reader/scene/SceneRun.h"
#include "reader/transcript/Transcript.h"
#include "tests/reader/ScreenPieces.h"
#include "tests/reader/WorkoutPieces.h"
#include "tests/tour/Samples.h"

namespace ax::reader::testing {
namespace {

std::string track(const std::string& points, const std::string& name = "") {
  return "<trk><name>" + name + "</name><type>running</type><trkseg>" + points + "</trkseg></trk>";
}

std::string point(const std::string& time, double latitude = 50) {
  return "<trkpt lat='" + std::to_string(latitude) + "' lon='10'><time>" + time + "</time></trkpt>";
}

std::string gpx(const std::string& tracks) {
  return "<gpx>" + tracks + "</gpx>";
}

std::string spoken(const Json& json) {
  host::linkHost();
  const Scene scene = readScene(json.dump(), "test");
  const SceneRun run(scene, {.modulePath = tour::modulePath()});
  std::string text;
  for (const std::string& line : transcript(takeSnapshot(run.screen()), run.title())) text += line + "\n";
  return text;
}

// Twenty minutes from each start, told by the clocks of New York.
TEST(WorkoutTimesTest, FollowTheClocksOfTheZone) {
  const std::tuple<std::string, std::string, std::string, std::string> workouts[] = {
      {"2026-03-08T06:50:00Z", "2026-03-08T07:10:00Z", "2026-03-08T01:50:00-05:00",
       "2026-03-08T03:10:00-04:00"},
      {"2026-11-01T05:50:00Z", "2026-11-01T06:10:00Z", "2026-11-01T01:50:00-04:00",
       "2026-11-01T01:10:00-05:00"},
      {"2027-01-01T04:50:00Z", "2027-01-01T05:10:00Z", "2026-12-31T23:50:00-05:00",
       "2027-01-01T00:10:00-05:00"},
      {"2026-06-01T09:20:00+05:30", "2026-05-31T23:40:00.000-0430", "2026-05-31T23:50:00-04:00",
       "2026-06-01T00:10:00-04:00"},
  };
  for (const auto& [from, to, start, end] : workouts) {
    const Json scene = sceneOfFile(fileOf(gpx(track(point(from) + point(to)))),
                                   {.locale = "en_US", .timeZone = "America/New_York"});
    const Json workout = all(scene, "Workout").at(0);
    EXPECT_EQ(workout["startDate"]["date"], start);
    EXPECT_EQ(workout["endDate"]["date"], end);
    EXPECT_EQ(workout["duration"], 1200.0) << start;
    EXPECT_EQ(scene["environment"]["now"], end);
    EXPECT_NE(spoken(scene).find("20 minutes"), std::string::npos) << spoken(scene);
  }
}

// One over midnight, at the end of a month, belongs to the month in which it begins.
TEST(WorkoutTimesTest, OverMidnightCountWhereTheyBegin) {
  const std::string night = track(point("2026-03-31T23:50:00Z") + point("2026-04-01T00:10:00Z"));
  const std::string morning = track(point("2026-04-01T07:00:00Z") + point("2026-04-01T07:10:00Z"));
  const Json scene = workoutListScene(fileOf(gpx(night + morning)).activities, {.timeZone = "UTC"});
  const std::vector<Json> months = all(scene, "CHWorkoutListTableHeaderView");
  ASSERT_EQ(months.size(), 2u);
  EXPECT_EQ(months[0]["month"]["date"], "2026-04-01T07:00:00+00:00");
  EXPECT_EQ(months[1]["month"]["date"], "2026-03-31T23:50:00+00:00");
  const std::string text = spoken(scene);
  EXPECT_LT(text.find("April"), text.find("March")) << text;
  EXPECT_NE(text.find("March"), std::string::npos) << text;
}

TEST(WorkoutTimesTest, TracksOfOneFileAreWorkoutsOfTheirOwn) {
  const std::string first = track(point("2026-03-08T07:00:00Z") + point("2026-03-08T07:10:00Z"), "First");
  const std::string second = track(point("2026-03-09T07:00:00Z") + point("2026-03-09T07:30:00Z"), "Second");
  const WorkoutFile file = fileOf(gpx(first + second));
  const Json list = sceneOfFile(file);
  EXPECT_EQ(all(list, "CHWorkoutsListTableViewCell").size(), 2u);
  const std::string text = spoken(list);
  EXPECT_NE(text.find("10 minutes"), std::string::npos) << text;
  EXPECT_NE(text.find("30 minutes"), std::string::npos) << text;
  const Json scene = workoutScene(file.activities[1]);
  EXPECT_EQ(scene["title"], "Second");
  EXPECT_EQ(all(scene, "Workout").front()["duration"], 1800.0);
}

// A run in the evening of New York is none of the next day, nor one beside it that was begun in Berlin.
TEST(WorkoutTimesTest, AreToldByTheClockOfTheFile) {
  const WorkoutFile evening =
      fileOf(gpx(track(point("2026-03-08T21:44:00-05:00") + point("2026-03-08T22:00:00-05:00", 50.01))));
  EXPECT_NE(spoken(sceneOfFile(evening)).find("Sunday, March 8, 2026 at 9:44"), std::string::npos)
      << spoken(sceneOfFile(evening));
  EXPECT_EQ(sceneOfFile(evening)["environment"]["timeZone"], "GMT-05:00");
  EXPECT_EQ(sceneOfFile(evening, {.timeZone = "Europe/Berlin"})["environment"]["timeZone"], "Europe/Berlin");
  const WorkoutFile night =
      fileOf(gpx(track(point("2026-03-07T23:30:00+01:00") + point("2026-03-07T23:50:00+01:00", 50.01))));
  const std::string list = spoken(workoutListScene({evening.activities.front(), night.activities.front()}));
  EXPECT_NE(list.find("Saturday, March 7"), std::string::npos) << list;
  EXPECT_NE(list.find("Sunday, March 8"), std::string::npos) << list;
}

TEST(WorkoutTimesTest, UnknownHeartRatesCountNeitherAsBeatsNorAsNothing) {
  std::mt19937 random(11);
  for (int run = 0; run < 20; ++run) {
    std::string points;
    double sum = 0, highest = 0, seconds = 0, last = 0;
    int lastSecond = -1;
    std::size_t count = 0;
    for (int i = 0; i < 30; ++i) {
      const int rate = 60 + int(random() % 120);
      const bool isKnown = random() % 3 != 0;
      if (isKnown) {
        if (lastSecond >= 0) {
          sum += (i - lastSecond) * (rate + last) / 2;
          seconds += i - lastSecond;
        }
        last = rate;
        lastSecond = i;
        highest = std::max<double>(highest, rate);
        ++count;
      }
      points += "<Trackpoint><Time>2026-03-08T07:00:" + std::to_string(10 + i) + "Z</Time>" +
                (isKnown ? "<HeartRateBpm><Value>" + std::to_string(rate) + "</Value></HeartRateBpm>" : "") +
                "</Trackpoint>";
    }
    const Json scene = sceneOfFile(
        fileOf("<TrainingCenterDatabase><Activities><Activity Sport='Running'><Lap "
               "StartTime='2026-03-08T07:00:10Z'><TotalTimeSeconds>30</TotalTimeSeconds><DistanceMeters>100"
               "</DistanceMeters><Track>" +
               points + "</Track></Lap></Activity></Activities></TrainingCenterDatabase>"));
    EXPECT_EQ(all(scene, "HeartRateSummaryReading").size(), count);
    EXPECT_NEAR(figure(scene, "figure.average.heart.rate")["quantity"][0].get<double>(), sum / seconds, 1e-4);
    EXPECT_EQ(figure(scene, "figure.maximum.heart.rate")["quantity"][0], highest);
    EXPECT_TRUE(all(scene, "_CHWorkoutDetailMapView").empty()) << "no place, no map";
  }
}

// A degree of latitude is some 111 kilometres, and the words are those of the region.
TEST(WorkoutTimesTest, DistancesAreSpokenInTheUnitsOfTheRegion) {
  const WorkoutFile file =
      fileOf(gpx(track(point("2026-03-08T07:00:00Z", 50) + point("2026-03-08T08:00:00Z", 50.1))));
  const std::pair<const char*, const char*> regions[] = {
      {"en_US", "6.91 miles"}, {"en_CA", "11.12 kilometers"}, {"de_DE", "11,12 Kilometer"}};
  for (const auto& [locale, words] : regions) {
    const std::string text = spoken(sceneOfFile(file, {.locale = locale}));
    EXPECT_NE(text.find(words), std::string::npos) << text;
  }
}

}  // namespace
}  // namespace ax::reader::testing
