#include "reader/importers/WorkoutScene.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>

#include "host/core/HostApp.h"
#include "platform/formatting/Region.h"
#include "platform/toolkit/DataSeriesMessages.h"
#include "reader/scene/SceneRun.h"
#include "tests/reader/WorkoutPieces.h"
#include "tests/tour/Samples.h"

namespace ax::reader::testing {
namespace {

std::string point(const std::string& time, int metres, const std::string& more = "") {
  return "<Trackpoint><Time>" + time + "</Time><DistanceMeters>" + std::to_string(metres) +
         "</DistanceMeters>" + more + "</Trackpoint>";
}

std::string heartRate(int rate) {
  return "<HeartRateBpm><Value>" + std::to_string(rate) + "</Value></HeartRateBpm>";
}

std::string lap(const std::string& start, int seconds, int metres, const std::string& points) {
  return "<Lap StartTime='" + start + "'><TotalTimeSeconds>" + std::to_string(seconds) +
         "</TotalTimeSeconds><DistanceMeters>" + std::to_string(metres) + "</DistanceMeters><Track>" +
         points + "</Track></Lap>";
}

std::string activity(const std::string& sport, const std::string& content) {
  return "<Activity Sport='" + sport + "'>" + content + "</Activity>";
}

std::string tcx(const std::string& activities) {
  return "<TrainingCenterDatabase><Activities>" + activities + "</Activities></TrainingCenterDatabase>";
}

const char* const here =
    "<Position><LatitudeDegrees>10</LatitudeDegrees><LongitudeDegrees>20</LongitudeDegrees></Position>";

// Two laps over the end of a month in UTC, three readings of 100, 131 and 162.
std::string run() {
  return activity("Running", lap("2026-03-31T23:50:00Z", 300, 1000,
                                 point("2026-03-31T23:50:00Z", 0, here + heartRate(100)) +
                                     point("2026-03-31T23:55:00.250Z", 1000, heartRate(131))) +
                                 lap("2026-03-31T23:55:00Z", 600, 1609,
                                     point("2026-04-01T00:05:00Z", 2609, heartRate(162))) +
                                 "<Notes>Over &quot;the hill&quot;</Notes>");
}

std::string bareActivity(const std::string& sport, const std::string& time) {
  return activity(sport, lap(time, 60, 0, "<Trackpoint><Time>" + time + "</Time></Trackpoint>"));
}

std::vector<std::string> rowsOf(const Json& scene) {
  std::vector<std::string> classes;
  for (const Json& row : scene["screen"]["set"]["view"]["subviews"]) classes.push_back(row["class"]);
  return classes;
}

// What the loader says of a scene; empty when it takes it.
std::string faultOf(const Json& scene) {
  host::linkHost();
  try {
    readScene(scene.dump(), "scene");
  } catch (const Fault& fault) {
    return fault.text();
  }
  return "";
}

TEST(WorkoutSceneTest, HasEveryRowOfAFullWorkout) {
  const Json scene = sceneOfFile(fileOf(tcx(run())), {.locale = "de_DE", .timeZone = "Asia/Tokyo"});
  EXPECT_EQ(faultOf(scene), "");
  EXPECT_EQ(rowsOf(scene),
            (std::vector<std::string>{
                "CHWorkoutSummaryTableViewCell", "CHWorkoutDetailTwoValueTableViewCell",
                "CHWorkoutDetailTwoValueTableViewCell", "CHWorkoutDetailPaceTableViewCell",
                "CHWorkoutDetailExpandingHeaderView", "CHWorkoutDetailSplitTableViewCell",
                "CHWorkoutDetailSplitTableViewCell", "CHWorkoutDetailHeartRateChartTableViewCell",
                "CHWorkoutDetailMapAndWeatherTableViewCell"}));
  EXPECT_EQ(scene["environment"]["now"], "2026-04-01T09:05:00+09:00");

  const std::vector<Json> readings = all(scene, "HeartRateSummaryReading");
  ASSERT_EQ(readings.size(), 3u);
  EXPECT_EQ(readings[1]["date"]["date"], "2026-04-01T08:55:00.250+09:00");
  EXPECT_EQ(readings[1]["quantity"]["quantity"], Json::parse(R"([131.0, "count/min"])"));

  const std::vector<Json> splits = all(scene, "CHWorkoutSplit");
  ASSERT_EQ(splits.size(), 2u);
  EXPECT_EQ(splits[1], Json::parse(R"({"index": 2, "duration": 600.0, "activityType": 11, "isRest": false,
                            "distance": {"quantity": [1.609, "km"]}})"));

  EXPECT_EQ(figure(scene, "figure.average.heart.rate")["quantity"][0], 131.0);
  EXPECT_EQ(figure(scene, "figure.maximum.heart.rate")["quantity"][0], 162.0);
  EXPECT_EQ(figure(scene, "figure.started")["date"], "2026-04-01T08:50:00+09:00");
}

TEST(WorkoutSceneTest, CountsInTheUnitOfTheRegion) {
  const WorkoutFile file = fileOf(tcx(run()));
  const auto unitWith = [&](const WorkoutSceneOptions& options) {
    return all(sceneOfFile(file, options), "Workout")[0]["totalDistance"]["quantity"][1].get<std::string>();
  };
  for (const char* locale : {"en_US", "en_GB", "es_US", "zh_Hant_US", "en_US@calendar=gregorian"}) {
    EXPECT_EQ(unitWith({.locale = locale}), "mi") << locale;
  }
  for (const char* locale : {"en_CA", "de_DE", "en", "ar_EG"})
    EXPECT_EQ(unitWith({.locale = locale}), "km") << locale;
  EXPECT_EQ(unitWith({.locale = "en_US", .units = DistanceUnits::metric}), "km");
  EXPECT_EQ(unitWith({.locale = "de_DE", .units = DistanceUnits::imperial}), "mi");
}

TEST(WorkoutSceneTest, LeavesOutWhatTheFileDoesNotTell) {
  const Json scene = sceneOfFile(fileOf(tcx(bareActivity("Other", "2026-03-08T07:00:00Z"))));
  EXPECT_EQ(faultOf(scene), "");
  EXPECT_EQ(rowsOf(scene),
            (std::vector<std::string>{"CHWorkoutSummaryTableViewCell", "CHWorkoutDetailTwoValueTableViewCell",
                                      "CHWorkoutDetailHeartRateChartTableViewCell"}));
  EXPECT_EQ(all(scene, "CHWorkoutDetailTwoValueTableViewCell")[0]["value2"], "") << "an odd one stands alone";
  const Json workout = all(scene, "Workout")[0];
  for (const char* key : {"totalDistance", "totalEnergyBurned", "sourceRevision"}) {
    EXPECT_FALSE(workout.contains(key)) << key;
  }

  const Json ride = sceneOfFile(
      fileOf("<gpx><trk><type>cycling</type><trkseg><trkpt lat='10' "
             "lon='20'><time>2026-03-08T07:00:00Z</time></trkpt>"
             "<trkpt lat='10.1' lon='20'><time>2026-03-08T07:30:00Z</time></trkpt></trkseg></trk></gpx>"));
  EXPECT_EQ(faultOf(ride), "");
  EXPECT_TRUE(all(ride, "CHWorkoutDetailExpandingHeaderView").empty()) << "splits without laps";
  EXPECT_EQ(all(ride, "_CHWorkoutDetailMapView").size(), 1u);
}

TEST(WorkoutSceneTest, SeveralWorkoutsMakeAListAndEachAScreen) {
  const WorkoutFile file = fileOf(tcx(activity("Biking", lap("2026-03-07T07:00:00Z", 60, 500, "")) + run() +
                                      bareActivity("Other", "2026-03-09T07:00:00Z")));
  const Json list = sceneOfFile(file);
  EXPECT_EQ(faultOf(list), "");
  ASSERT_EQ(all(list, "CHWorkoutsListTableViewCell").size(), 3u);
  EXPECT_EQ(all(list, "CHWorkoutListTableHeaderView")[0]["numberOfWorkouts"], 3);
  const Json bare = workoutScene(file.activities[0]);
  EXPECT_EQ(faultOf(bare), "") << "of a workout that only its laps tell of";
  EXPECT_EQ(bare["screen"]["set"]["title"]["localized"], "workout.cycling");
}

TEST(WorkoutSceneTest, ThinsOutMoreReadingsThanAChartShows) {
  WorkoutActivity ride = fileOf(tcx(run())).activities.front();
  ride.points.clear();
  for (int i = 0; i < 50000; ++i) {
    TrackPoint point;
    point.time = ride.start + i * ride.duration / 50000;
    point.heartRate = static_cast<float>(i == 777 ? 40 : i == 40000 ? 220 : 100 + i % 7);
    ride.points.push_back(point);
  }
  const std::vector<Json> readings = all(workoutScene(ride), "HeartRateSummaryReading");
  EXPECT_LE(readings.size(), 16000u);
  const auto has = [&](double rate) {
    return std::ranges::count_if(readings,
                                 [=](const Json& each) { return each["quantity"]["quantity"][0] == rate; });
  };
  EXPECT_EQ(has(40), 1);
  EXPECT_EQ(has(220), 1);
  EXPECT_TRUE(std::ranges::is_sorted(
      readings, {}, [](const Json& each) { return each["date"]["date"].get<std::string>(); }));
}

// Heart rates that go up and down; one each ten seconds of 800.
int rateAt(int reading) {
  return 90 + reading * 37 % 61;
}

std::string steadyRun() {
  std::string points;
  for (int i = 0; i <= 80; ++i) {
    char time[32];
    std::snprintf(time, sizeof time, "2026-03-08T07:%02d:%02dZ", i / 6, i % 6 * 10);
    points += point(time, i * 30, heartRate(rateAt(i)));
  }
  return activity("Running", lap("2026-03-08T07:00:00Z", 800, 2400, points));
}

TEST(WorkoutSceneTest, HasTheFilesHeartRateInEachSliceOfTheChart) {
  const Scene scene = readScene(sceneOfFile(fileOf(tcx(steadyRun()))).dump(), "steady run");
  const SceneRun run(scene, {.modulePath = tour::modulePath()});
  const Ref<Object> chart = run.objectWithId("heart-rate");
  ASSERT_EQ(messages::_accessibilityNumberOfSlices(chart), 8u);
  EXPECT_EQ(messages::_accessibilityTimeIntervalPerSlice(chart), 100);
  for (int slice = 0; slice < 8; ++slice) {
    int lowest = rateAt(slice * 10);
    int highest = lowest;
    for (int i = slice * 10; i <= slice * 10 + 10; ++i) {
      lowest = std::min(lowest, rateAt(i));
      highest = std::max(highest, rateAt(i));
    }
    const auto spoken = messages::_accessibilityQuantityForSliceAtIndex(chart, std::uint64_t(slice));
    EXPECT_EQ(spoken->text(), std::to_string(lowest) + " to " + std::to_string(highest) + " beats per minute")
        << slice;
  }
}

TEST(WorkoutListSceneTest, GroupsByTheMonthOfTheTimeZone) {
  const std::vector<WorkoutActivity> files =
      fileOf(tcx(bareActivity("Other", "2026-03-08T07:00:00Z") + run() +
                 bareActivity("Other", "2025-04-08T07:00:00Z")))
          .activities;
  const auto countsIn = [&](const std::string& zone) {
    const Json scene = workoutListScene(files, {.timeZone = zone});
    EXPECT_EQ(faultOf(scene), "");
    std::vector<int> counts;
    for (const Json& header : all(scene, "CHWorkoutListTableHeaderView"))
      counts.push_back(header["numberOfWorkouts"]);
    return counts;
  };
  EXPECT_EQ(countsIn("UTC"), (std::vector{2, 1})) << "the same month of two years stays apart";
  EXPECT_EQ(countsIn("Asia/Tokyo"), (std::vector{1, 1, 1}));

  const Json scene = workoutListScene(files);
  EXPECT_EQ(rowsOf(scene).front(), "CHWorkoutsListSummaryTableViewCell");
  EXPECT_EQ(all(scene, "CHWorkoutsListSummaryTableViewCell")[0]["workouts"].size(), 3u);
  EXPECT_EQ(scene["environment"]["now"], "2026-04-01T00:05:00+00:00");
}

TEST(WorkoutSceneTest, LeavesTheRegionOfTheProcessAlone) {
  const formatting::Region before = formatting::currentRegion();
  sceneOfFile(fileOf(tcx(run())), {.locale = "ja_JP", .timeZone = "Asia/Tokyo"});
  EXPECT_EQ(formatting::currentRegion(), before);
  const Json scene = sceneOfFile(fileOf(tcx(run())), {.locale = "nowhere", .timeZone = "Mars/Olympus"});
  EXPECT_EQ(scene["environment"]["timeZone"], "UTC");
  EXPECT_EQ(faultOf(scene), "");
}

}  // namespace
}  // namespace ax::reader::testing
