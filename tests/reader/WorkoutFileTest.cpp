#include "reader/importers/WorkoutFile.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <string>
#include <string_view>
#include <variant>

#include "reader/importers/Sport.h"
#include "reader/importers/WorkoutFileReader.h"
#include "reader/importers/XmlFields.h"

namespace ax::reader {
namespace {

constexpr double seven = 1772953200;  // 2026-03-08 07:00:00 UTC

WorkoutFile readWell(std::string_view bytes) {
  WorkoutFileResult result = readWorkoutFile(bytes, "test");
  if (const auto* fault = std::get_if<WorkoutFileFault>(&result)) {
    ADD_FAILURE() << fault->what << " at " << fault->place;
    return {{WorkoutActivity{}}, std::nullopt};
  }
  return std::get<WorkoutFile>(std::move(result));
}

WorkoutActivity readOne(std::string_view bytes) {
  const WorkoutFile file = readWell(bytes);
  EXPECT_EQ(file.activities.size(), 1U);
  return file.activities.front();
}

std::string inTcx(const std::string& activities) {
  return "<TrainingCenterDatabase><Activities>" + activities +
         "</Activities><Author><Name>Log</Name></Author></TrainingCenterDatabase>";
}

std::string inLap(const std::string& content) {
  return inTcx("<Activity Sport='Running'><Lap StartTime='2026-03-08T07:00:00Z'>" + content +
               "</Lap></Activity>");
}

std::string inGpx(const std::string& content) {
  return "<gpx creator='Log'>" + content + "</gpx>";
}

// A track point at that many seconds past seven, with more elements.
std::string tcxPoint(int seconds, const std::string& content = "") {
  const std::string two = std::to_string(100 + seconds).substr(1);
  return "<Trackpoint><Time>2026-03-08T07:00:" + two + "Z</Time>" + content + "</Trackpoint>";
}

std::string position(const std::string& latitude, const std::string& longitude) {
  return "<Position><LatitudeDegrees>" + latitude + "</LatitudeDegrees><LongitudeDegrees>" + longitude +
         "</LongitudeDegrees></Position>";
}

std::string gpxPoint(const std::string& latitude, const std::string& time, const std::string& content = "") {
  return "<trkpt lat='" + latitude + "' lon='10'><time>" + time + "</time>" + content + "</trkpt>";
}

constexpr std::string_view pausedRun = R"(
<?xml version="1.0"?>
<t:TrainingCenterDatabase xmlns:t="urn:t" xmlns:x="urn:x"><t:Activities>
 <t:Activity Sport="Running">
  <t:Id>2026-03-08T07:00:00Z</t:Id>
  <t:Lap StartTime="2026-03-08T07:00:00.000Z">
   <t:TotalTimeSeconds>20.5</t:TotalTimeSeconds><t:DistanceMeters> 60.25 </t:DistanceMeters>
   <t:Calories>4</t:Calories>
   <t:Track>
    <t:Trackpoint><t:Time> 2026-03-08T07:00:00.000Z
      </t:Time><t:HeartRateBpm><t:Value>95</t:Value></t:HeartRateBpm></t:Trackpoint>
    <t:Trackpoint><t:Time>2026-03-08T08:00:10.500+01:00</t:Time><t:DistanceMeters>30</t:DistanceMeters>
      <t:Extensions><x:TPX><x:Speed>3</x:Speed></x:TPX></t:Extensions></t:Trackpoint>
   </t:Track>
  </t:Lap>
  <t:Lap StartTime="2026-03-08T07:01:10Z">
   <t:TotalTimeSeconds>30</t:TotalTimeSeconds><t:DistanceMeters>90</t:DistanceMeters>
   <t:Track><t:Trackpoint><t:Time>2026-03-08T07:01:10Z</t:Time></t:Trackpoint></t:Track>
   <t:Track><t:Trackpoint><t:Time>2026-03-08T07:01:40Z</t:Time><t:HeartRateBpm><t:Value>151.5</t:Value>
      </t:HeartRateBpm></t:Trackpoint></t:Track>
  </t:Lap>
  <t:Notes>
    Along   the canal
    with a second line
  </t:Notes>
  <t:Creator><t:Name>Tern 2</t:Name></t:Creator>
 </t:Activity>
</t:Activities></t:TrainingCenterDatabase>)";

TEST(TcxFileTest, ReadsLapsPausesAndPrefixedElements) {
  const WorkoutActivity run = readOne(pausedRun);
  EXPECT_EQ(run.title, "Along the canal");
  EXPECT_EQ(run.sport, "running");
  EXPECT_EQ(run.sourceName, "Tern 2");
  EXPECT_EQ(run.start, seven);
  EXPECT_EQ(run.duration, 100);
  EXPECT_EQ(run.activeSeconds, 50.5);
  EXPECT_EQ(run.metres, 150.25);
  EXPECT_EQ(run.measures.kilocalories, 4);
  ASSERT_EQ(run.points.size(), 4U);
  EXPECT_EQ(run.points[1].time, seven + 10.5);
  EXPECT_EQ(run.points[0].heartRate, 95);
  EXPECT_EQ(run.points[1].heartRate, std::nullopt);
  EXPECT_EQ(run.points[3].heartRate, 151.5);
  ASSERT_EQ(run.laps.size(), 2U);
  EXPECT_EQ(run.laps[1].start, seven + 70);
  EXPECT_EQ(run.laps[1].points.first, 2U);
  EXPECT_EQ(run.laps[1].points.count, 2U);
  EXPECT_EQ(run.laps[1].told.kilocalories, std::nullopt);
  ASSERT_EQ(run.segments.size(), 2U) << "one pause, inside the second lap";
  EXPECT_EQ(run.segments[0].count, 3U);
  EXPECT_EQ(run.segments[1].count, 1U);
}

TEST(TcxFileTest, LeavesOutValuesThatCannotBe) {
  for (const char* rate : {"0", "-3", "nan", "inf", "1e999", "12,5", "12 bpm", "256", ""}) {
    const auto beats = "<HeartRateBpm><Value>" + std::string(rate) + "</Value></HeartRateBpm>";
    const auto run = readOne(inLap("<Track>" + tcxPoint(0, beats + position("60", "+10")) + "</Track>"));
    EXPECT_EQ(run.points.at(0).heartRate, std::nullopt) << rate;
    EXPECT_EQ(run.points.at(0).longitude, 10) << rate;
  }
  for (const auto& place : {position("90.1", "10"), position("60", "181"), position("60", ""),
                            position("", "10"), position("0.0", "0.0")}) {
    const auto run = readOne(inLap("<Track>" + tcxPoint(0, place) + "</Track>"));
    EXPECT_FALSE(run.points.at(0).latitude || run.points.at(0).longitude) << place;
  }
}

TEST(TcxFileTest, MeasuresWhatTheLapsDoNotTell) {
  const std::string recorded = "<Track>" + tcxPoint(0, "<DistanceMeters>5</DistanceMeters>") + tcxPoint(9) +
                               tcxPoint(20, "<DistanceMeters>70</DistanceMeters>") + "</Track>";
  const auto zeroLap = readOne(inLap("<DistanceMeters>0.0</DistanceMeters>" + recorded));
  EXPECT_EQ(zeroLap.metres, 70);
  EXPECT_EQ(zeroLap.activeSeconds, 20);
  EXPECT_EQ(zeroLap.points[1].distance, std::nullopt) << "recorded distances are not filled up";

  // A thousandth of a degree of latitude is 111.195 m; the way walked during the pause does not count.
  const auto measured = readOne(inLap("<Track>" + tcxPoint(0, position("50.000", "179.9")) + tcxPoint(5) +
                                      tcxPoint(30, position("50.001", "179.9")) + "</Track><Track>" +
                                      tcxPoint(50, position("50.003", "179.9")) +
                                      tcxPoint(59, position("50.004", "179.9")) + "</Track>"));
  EXPECT_NEAR(measured.metres, 222.39, 0.01);
  EXPECT_NEAR(measured.points[3].distance.value_or(0), 111.195, 0.01);
  EXPECT_EQ(measured.activeSeconds, 39);
  EXPECT_EQ(measured.duration, 59);

  const auto dateLine = readOne(inLap("<Track>" + tcxPoint(0, position("60", "179.9995")) +
                                      tcxPoint(9, position("60", "-179.9995")) + "</Track>"));
  EXPECT_NEAR(dateLine.metres, 55.6, 0.01);

  const auto still = readOne(inLap("<DistanceMeters>0.0</DistanceMeters><Track>" + tcxPoint(0) + "</Track>"));
  EXPECT_EQ(still.metres, 0);
}

TEST(TcxFileTest, MeasuresLapsThatCountFromZeroAgain) {
  const auto track = [](const char* metres, int second) {
    return "<Track>" + tcxPoint(second, "<DistanceMeters>" + std::string(metres) + "</DistanceMeters>") +
           "</Track></Lap>";
  };
  const auto run = readOne(inTcx("<Activity><Lap>" + track("400", 1) + "<Lap>" + track("150", 2) + "<Lap>" +
                                 track("250", 3) + "<Lap><Calories>7</Calories></Lap></Activity>"));
  ASSERT_EQ(run.laps.size(), 3U) << "a lap that no time is known of is left out";
  EXPECT_EQ(run.laps[0].start, seven + 1);
  EXPECT_EQ(run.laps[0].metres, 400);
  EXPECT_EQ(run.laps[1].metres, 150);
  EXPECT_EQ(run.laps[2].metres, 100);
}

TEST(TcxFileTest, TakesTheFiguresOfItsLaps) {
  const auto lap = [](const char* seconds, const char* figures) {
    return "<Lap StartTime='2026-03-08T07:00:00Z'><TotalTimeSeconds>" + std::string(seconds) +
           "</TotalTimeSeconds>" + figures + "<Track>" +
           tcxPoint(0, "<HeartRateBpm><Value>90</Value></HeartRateBpm>") + "</Track></Lap>";
  };
  const auto run = readOne(inTcx(
      "<Activity Sport='Running'>" +
      lap("300",
          "<AverageHeartRateBpm><Value>120</Value></AverageHeartRateBpm><MaximumHeartRateBpm><Value>150</"
          "Value>"
          "</MaximumHeartRateBpm>") +
      lap("100",
          "<AverageHeartRateBpm><Value>160</Value></AverageHeartRateBpm><Intensity>Resting</Intensity>") +
      "</Activity>"));
  EXPECT_EQ(run.measures.averageHeartRate, 130);
  EXPECT_EQ(run.measures.maximumHeartRate, 150);
  EXPECT_FALSE(run.laps[0].isRest);
  EXPECT_TRUE(run.laps[1].isRest);
}

TEST(TcxFileTest, BeginsTheDistanceOfEachActivityAtZero) {
  const auto activity = [](int from, int to) {
    const auto at = [](int metres) {
      return "<DistanceMeters>" + std::to_string(metres) + "</DistanceMeters>";
    };
    return "<Activity><Lap><Track>" + tcxPoint(0, at(from)) + tcxPoint(9, at(to)) +
           "</Track></Lap></Activity>";
  };
  const WorkoutFile file = readWell(inTcx(activity(0, 500) + activity(500, 800) + activity(5, 70)));
  ASSERT_EQ(file.activities.size(), 3U);
  EXPECT_EQ(file.activities[1].laps[0].metres, 300);
  EXPECT_EQ(file.activities[1].points[0].distance, 0);
  EXPECT_EQ(file.activities[2].laps[0].metres, 70) << "this one counts anew";
}

TEST(TcxFileTest, TakesTimesInAnyOrder) {
  const auto run = readOne(inLap("<Track>" + tcxPoint(30) + tcxPoint(10) + tcxPoint(10) + tcxPoint(50) +
                                 tcxPoint(40) + "</Track>"));
  EXPECT_EQ(run.start, seven + 10);
  EXPECT_EQ(run.duration, 40);
  EXPECT_EQ(run.activeSeconds, 40);
  EXPECT_EQ(run.points[0].time, seven + 30);
}

TEST(TcxFileTest, ReadsEveryActivityThatTellsSomething) {
  const std::string lap = "<Lap StartTime='2026-03-08T07:00:00Z'><TotalTimeSeconds>600</TotalTimeSeconds>";
  const std::string leg =
      "<Activity Sport='Swimming'>" + lap + "<Track>" + tcxPoint(1) + "</Track></Lap></Activity>";
  const WorkoutFile file = readWell(inTcx("<Activity Sport='Biking'>" + lap +
                                          "</Lap></Activity><Activity/><MultiSportSession><Id/>"
                                          "<FirstSport>" +
                                          leg + "</FirstSport><NextSport><Transition/>" + leg +
                                          "</NextSport></MultiSportSession>"));
  ASSERT_EQ(file.activities.size(), 3U);
  EXPECT_EQ(file.activities[0].sport, "cycling");
  EXPECT_EQ(file.activities[0].start, seven) << "without points the laps tell";
  EXPECT_EQ(file.activities[0].duration, 600);
  EXPECT_EQ(file.activities[2].sport, "swimming");
  EXPECT_EQ(file.activities[2].sourceName, "Log");
}

TEST(GpxFileTest, ReadsTracksSegmentsAndHeartRates) {
  const std::string direct = "<extensions><hr>100</hr></extensions>";
  const std::string nested =
      "<g:extensions><p:TrackPointExtension><p:atemp>9</p:atemp><p:hr> 101.5 </p:hr>"
      "</p:TrackPointExtension></g:extensions>";
  const WorkoutFile file = readWell(
      "<g:gpx xmlns:g='urn:g' xmlns:p='urn:p' creator='Wayfarer Log'><g:metadata><g:name>A day out</g:name>"
      "</g:metadata><wpt lat='1' lon='2'><time>2026-03-08T07:00:00Z</time></wpt><trk><name> </name>"
      "<type>Ride</type><trkseg>" +
      gpxPoint("50", "2026-03-08T07:00:00.250Z", direct) +
      gpxPoint("50.001", "2026-03-08T07:00:20.750Z", nested) + gpxPoint("50.9", "soon") +
      "</trkseg><trkseg/><trkseg>" + gpxPoint("50.002", "2026-03-08T07:02:00.250Z") +
      gpxPoint("x", "2026-03-08T07:02:30.250Z") +
      "</trkseg></trk><trk><name>Home <![CDATA[&]]> &#233;</name>"
      "<trkseg>" +
      gpxPoint("1", "2026-03-08T07:00:00") + "</trkseg></trk></g:gpx>");
  ASSERT_EQ(file.activities.size(), 2U);
  const WorkoutActivity& ride = file.activities[0];
  EXPECT_EQ(ride.title, "A day out");
  EXPECT_EQ(ride.sport, "cycling");
  EXPECT_EQ(ride.sourceName, "Wayfarer Log");
  EXPECT_EQ(ride.start, seven + 0.25);
  EXPECT_EQ(ride.duration, 150);
  EXPECT_EQ(ride.activeSeconds, 50.5);
  EXPECT_NEAR(ride.metres, 111.195, 0.01);
  ASSERT_EQ(ride.points.size(), 4U) << "the point without a time is left out";
  EXPECT_EQ(ride.points[0].heartRate, 100);
  EXPECT_EQ(ride.points[1].heartRate, 101.5);
  EXPECT_FALSE(ride.points[3].latitude || ride.points[3].longitude || ride.points[3].distance);
  EXPECT_EQ(ride.segments.size(), 2U);
  EXPECT_TRUE(ride.laps.empty());
  EXPECT_EQ(file.activities[1].title, "Home & \xC3\xA9");
  EXPECT_EQ(file.activities[1].start, seven);
}

TEST(GpxFileTest, CountsTheWholeSpanWhenEverySegmentIsOnePoint) {
  const auto walk =
      readOne(inGpx("<trk><type>walking</type><trkseg>" + gpxPoint("50", "2026-03-08T07:00:00Z") +
                    "</trkseg><trkseg>" + gpxPoint("50", "2026-03-08T07:10:00Z") + "</trkseg></trk>"));
  EXPECT_EQ(walk.activeSeconds, 600);
}

// A hundredth of a thousandth of a degree is 1.1 m.
TEST(GpxFileTest, LeavesOutTheTimeInWhichNobodyMovedAndNothingWasWritten) {
  const auto at = [](const char* latitude, const char* clock, const std::string& more = "") {
    return gpxPoint(latitude, "2026-03-08T07:" + std::string(clock) + "Z", more);
  };
  const auto ride =
      readOne(inGpx("<trk><trkseg>" + at("50.00000", "00:00") + at("50.00040", "00:10") +
                    at("50.00080", "00:20") + at("50.00081", "05:00") +  // stood at a light
                    at("50.00120", "05:10") + at("50.00400", "06:10") +  // went on through a tunnel
                    at("50.00440", "06:20") + "</trkseg></trk>"));
  EXPECT_EQ(ride.activeSeconds, 100);
  EXPECT_EQ(ride.duration, 380);
}

TEST(GpxFileTest, WeighsHeartRatesByTimeAndClimbsByWhatIsMoreThanNoise) {
  const auto hr = [](const char* rate, const std::string& altitude) {
    return "<ele>" + altitude + "</ele><extensions><hr>" + rate +
           "</hr><cad>80</cad><power>200</power></extensions>";
  };
  std::string points;
  for (int second = 0; second < 600; ++second) {
    char time[32];
    std::snprintf(time, sizeof time, "2026-03-08T07:%02d:%02d-05:00", second / 60, second % 60);
    // Ten minutes to and fro by a meter, in the second half up by 60 meters.
    const double height = 100 + second % 2 + (second < 300 ? 0 : (second - 300) * 0.2);
    if (second < 300 || second % 30 == 0)
      points += gpxPoint("50", time, hr(second < 300 ? "100" : "160", std::to_string(height)));
  }
  const auto walk = readOne(inGpx("<trk><trkseg>" + points + "</trkseg></trk>"));
  EXPECT_NEAR(walk.measures.averageHeartRate.value_or(0), 128.4, 1) << "not the 102 of the points";
  EXPECT_EQ(walk.measures.maximumHeartRate, 160);
  EXPECT_EQ(walk.measures.averageCadence, 80);
  EXPECT_EQ(walk.measures.averagePower, 200);
  EXPECT_NEAR(walk.measures.elevationGain.value_or(0), 54, 2);
  EXPECT_EQ(walk.secondsEastOfUtc, -5 * 3600);
}

TEST(WorkoutFileReaderTest, UnderstandsTheEncodingsThatFilesComeIn) {
  const std::string start = "<?xml version='1.0'?>" + inGpx("<trk><name>Caf");
  const std::string cut = start.substr(0, start.size() - std::string("</gpx>").size());
  const std::string rest =
      "</name><trkseg>" + gpxPoint("50", "2026-03-08T07:00:00Z") + "</trkseg></trk></gpx>";
  const std::string utf8 = cut + "\xC3\xA9" + rest;
  const std::string latin1 = cut + "\xE9" + rest;
  std::string utf16 = "\xFF\xFE";
  for (const char c : latin1) utf16 += {c, '\0'};
  for (const auto& bytes :
       {utf8, latin1, utf16, "\xEF\xBB\xBF" + utf8, " \r\n\t" + utf8, "\n\xEF\xBB\xBF" + utf8}) {
    EXPECT_EQ(readOne(bytes).title, "Caf\xC3\xA9") << bytes;
  }
  const auto declaring = [&](const std::string& encoding, const std::string& end) {
    return "<?xml version='1.0' encoding='" + encoding + "'?>" + cut.substr(cut.find("?>") + 2) + end + rest;
  };
  EXPECT_EQ(readOne(declaring("KOI8-R", "\xC1")).title, "Caf\xD0\xB0");
  EXPECT_EQ(readOne(declaring("windows-1252", "\x80")).title, "Caf\xE2\x82\xAC");
  EXPECT_EQ(readOne(declaring("UTF-8", "\xE9 \xC3\xA9")).title, "Caf\xEF\xBF\xBD \xC3\xA9") << "one bad byte";
  EXPECT_EQ(readOne(cut + "\xE9 \xC3\xA9" + rest).title, "Caf\xEF\xBF\xBD \xC3\xA9");
  EXPECT_EQ(readOne(declaring("no such", "\xC3\xA9")).title, "Caf\xC3\xA9");
  EXPECT_EQ(readOne(cut + "&#xD800;" + rest).title, "") << "half a character is no text";
}

struct FaultCase {
  std::string bytes, what, place, expected;
};

TEST(WorkoutFileReaderTest, TellsWhatIsWrongWithAFileAndWhere) {
  const FaultCase cases[] = {
      {" ", "there is no element", "line 1, column 1", "an XML document"},
      {"<?xml version='1.0'?>\n <k:kml xmlns:k='u'/>", "the root element is kml", "line 2, column 3",
       "TrainingCenterDatabase or gpx"},
      {"<gpx>\n  <trk>\n", "the file is cut off", "line 2, column 8", "all elements closed"},
      {"<gpx>\n<a>\xC3\xA9</b></a></gpx>", "not XML: Start-end tags mismatch", "line 2, column 7",
       "well-formed XML"},
      {"<gpx/>\n<gpx/>", "something stands beside the root element", "line 2, column 2",
       "one root element and nothing else"},
      {"HTTP/1.1 200\n<gpx/>", "something stands beside the root element", "line 1, column 1",
       "one root element and nothing else"},
      {inGpx("<rte/>"), "no workout", "gpx", "at least one trk"},
      {inGpx("<trk><trkseg>" + gpxPoint("5", "") + "</trkseg></trk>"), "no point with a time", "gpx/trk",
       "at least a trkpt with a time"},
      {"<TrainingCenterDatabase/>", "no workout", "TrainingCenterDatabase/Activities",
       "at least one Activity"},
      {inLap("<Track/>"), "no point with a time", "TrainingCenterDatabase/Activities/Activity",
       "at least a Trackpoint with a Time"},
  };
  for (const FaultCase& each : cases) {
    const WorkoutFileResult result = readWorkoutFile(each.bytes, "a.gpx");
    const auto* fault = std::get_if<WorkoutFileFault>(&result);
    ASSERT_TRUE(fault) << each.bytes;
    EXPECT_EQ(fault->file, "a.gpx");
    EXPECT_EQ(fault->what, each.what) << each.bytes;
    EXPECT_EQ(fault->place, each.place) << each.bytes;
    EXPECT_EQ(fault->expected, each.expected) << each.bytes;
  }
}

TEST(WorkoutFileReaderTest, BoundsWhatElementsMayTake) {
  std::string deep;
  for (int i = 0; i < 101; ++i) deep += "<a>";
  const WorkoutFileResult nested = readWorkoutFile(deep, "deep");
  ASSERT_TRUE(std::holds_alternative<WorkoutFileFault>(nested));
  EXPECT_EQ(std::get<WorkoutFileFault>(nested).what, "elements nested more than 100 deep");
  EXPECT_EQ(std::get<WorkoutFileFault>(nested).place, "line 1, column 302");

  std::string many = "<gpx>";
  while (many.size() < 1100000) many += "<a/>";
  const WorkoutFileResult result = readWorkoutFile(many + "</gpx>", "many");
  ASSERT_TRUE(std::holds_alternative<WorkoutFileFault>(result));
  EXPECT_EQ(std::get<WorkoutFileFault>(result).what, "more elements than a workout of this size has");

  const std::string marks = "<!-- <a><a> --><?a <a>?><gpx a='<>'><![CDATA[" + deep + "]]>";
  EXPECT_EQ(
      readOne(marks + "<trk><trkseg>" + gpxPoint("50", "2026-03-08T07:00:00Z") + "</trkseg></trk></gpx>")
          .start,
      seven);
}

TEST(WorkoutFileReaderTest, ReadsADamagedFileAsFarAsItGoesWhenAsked) {
  const std::string cut = "<gpx><trk><trkseg>" + gpxPoint("50", "2026-03-08T07:00:00Z") +
                          gpxPoint("50.001", "2026-03-08T07:01:00Z");
  const WorkoutFileResult result = readWorkoutFile(cut, "cut.gpx", {.readsDamaged = true});
  const auto* file = std::get_if<WorkoutFile>(&result);
  ASSERT_TRUE(file);
  EXPECT_EQ(file->activities[0].duration, 60);
  ASSERT_TRUE(file->damage);
  EXPECT_EQ(file->damage->file, "cut.gpx");
  EXPECT_EQ(file->damage->what, "the file is cut off");
}

TEST(WorkoutFileReaderTest, RefusesAFileCutAnywhere) {
  for (std::size_t length = 0; length < pausedRun.size(); ++length) {
    const WorkoutFileResult result = readWorkoutFile(pausedRun.substr(0, length), "test");
    ASSERT_TRUE(std::holds_alternative<WorkoutFileFault>(result)) << length;
  }
}

TEST(WorkoutTimeTest, IsInUtcUnlessTheFileTellsAnOffset) {
  const auto parsed = [](const char* text) { return parseTime(text).value_or(FileTime{}); };
  for (const char* text : {"2026-03-08T07:00:00", " 2026-03-08T07:00:00Z\n", "2026-03-07T23:00:00-0800"}) {
    EXPECT_EQ(parsed(text).time, seven) << text;
  }
  EXPECT_EQ(parsed("2026-03-08T07:00:00Z").secondsEastOfUtc, std::nullopt);
  EXPECT_EQ(parsed("2026-03-07T23:00:00-0800").secondsEastOfUtc, -28800);
  EXPECT_FALSE(parseTime("2026-03-08")) << "a day is no moment";
}

TEST(WorkoutSportTest, KnowsTheWordsOfFiles) {
  const std::pair<const char*, const char*> cases[] = {{"Running", "running"},
                                                       {"TrailRun", "running"},
                                                       {"Biking", "cycling"},
                                                       {"mountain_biking", "cycling"},
                                                       {"VirtualRide", "cycling"},
                                                       {"E-Bike", "cycling"},
                                                       {"WALKING", "walking"},
                                                       {"Hike", "hiking"},
                                                       {"open_water_swimming", "swimming"},
                                                       {"Yoga", "yoga"},
                                                       {"Other", "other"},
                                                       {"", "other"},
                                                       {"Motorcycling", "other"},
                                                       {"trunk lifts", "other"}};
  for (const auto& [text, sport] : cases) EXPECT_EQ(sportNamed(text), sport) << text;
}

}  // namespace
}  // namespace ax::reader
