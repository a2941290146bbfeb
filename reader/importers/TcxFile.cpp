#include "reader/importers/TcxFile.h"

#include "reader/importers/PointFigures.h"
#include "reader/importers/RouteMeasures.h"
#include "reader/importers/Sport.h"
#include "reader/importers/XmlFields.h"

namespace ax::reader {
namespace {

struct PointField {
  std::string_view path;
  std::optional<double> TrackPoint::*field;
  NumberLimits limits;
};

constexpr PointField pointFields[] = {
    {"Position/LatitudeDegrees", &TrackPoint::latitude, latitudes},
    {"Position/LongitudeDegrees", &TrackPoint::longitude, longitudes},
    {"DistanceMeters", &TrackPoint::distance, notNegative},
};

struct ShortField {
  std::string_view path;
  std::optional<float> TrackPoint::*field;
  NumberLimits limits;
};

// The later ones of a point take the place of the earlier ones.
constexpr ShortField shortFields[] = {
    {"HeartRateBpm/Value", &TrackPoint::heartRate, heartRates},
    {"AltitudeMeters", &TrackPoint::altitude, altitudes},
    {"Cadence", &TrackPoint::cadence, cadences},
    {"Extensions/TPX/RunCadence", &TrackPoint::cadence, cadences},
    {"Extensions/TPX/Watts", &TrackPoint::power, powers},
};

struct LapField {
  std::string_view path;
  std::optional<double> Measures::*field;
  NumberLimits limits;
};

constexpr LapField lapFields[] = {
    {"Calories", &Measures::kilocalories, notNegative},
    {"AverageHeartRateBpm/Value", &Measures::averageHeartRate, heartRates},
    {"MaximumHeartRateBpm/Value", &Measures::maximumHeartRate, heartRates},
    {"Cadence", &Measures::averageCadence, {1, 254}},
    {"Extensions/LX/AvgRunCadence", &Measures::averageCadence, {1, 254}},
    {"Extensions/LX/AvgWatts", &Measures::averagePower, {1, 10000}},
};

std::optional<double> amountIn(pugi::xml_node node, std::string_view path) {
  return parseNumber(textOf(childAt(node, path)), notNegative);
}

PointRange appendTrack(pugi::xml_node track, WorkoutActivity& activity) {
  const std::size_t first = activity.points.size();
  for (const pugi::xml_node node : childrenNamed(track, "Trackpoint")) {
    const auto time = parseTime(textOf(childNamed(node, "Time")));
    if (!time) continue;
    if (activity.points.empty()) activity.secondsEastOfUtc = time->secondsEastOfUtc;
    TrackPoint point;
    point.time = time->time;
    for (const PointField& each : pointFields) {
      point.*each.field = parseNumber(textOf(childAt(node, each.path)), each.limits);
    }
    for (const ShortField& each : shortFields) {
      const auto value = parseShort(textOf(childAt(node, each.path)), each.limits);
      if (value) point.*each.field = value;
    }
    dropFalsePosition(point);
    activity.points.push_back(point);
  }
  return {first, activity.points.size() - first};
}

// A lap takes over from the one before without a pause; between the tracks of one lap the clock stood still.
// Answers the seconds that the clock ran, as far as the points tell.
double appendTracks(pugi::xml_node node, WorkoutActivity& activity) {
  double seconds = 0;
  bool takesOver = !activity.segments.empty();
  for (const pugi::xml_node track : childrenNamed(node, "Track")) {
    const PointRange range = appendTrack(track, activity);
    if (range.count == 0) continue;
    seconds += secondsOf(pointsIn(activity, range));
    if (takesOver) {
      activity.segments.back().count += range.count;
    } else {
      activity.segments.push_back(range);
    }
    takesOver = false;
  }
  return seconds;
}

void appendLap(pugi::xml_node node, WorkoutActivity& activity) {
  Lap lap;
  lap.points.first = activity.points.size();
  const double trackSeconds = appendTracks(node, activity);
  lap.points.count = activity.points.size() - lap.points.first;
  const auto start = parseTime(node.attribute("StartTime").value());
  if (!start && lap.points.count == 0) return;
  lap.start = start ? start->time : activity.points[lap.points.first].time;
  const double clock = amountIn(node, "TotalTimeSeconds").value_or(0);
  lap.seconds = clock > 0 ? clock : trackSeconds;
  lap.metres = amountIn(node, "DistanceMeters").value_or(0);
  lap.isRest = textOf(childNamed(node, "Intensity")) == "Resting";
  for (const LapField& each : lapFields) {
    const auto value = parseNumber(textOf(childAt(node, each.path)), each.limits);
    if (value) lap.told.*each.field = value;
  }
  activity.laps.push_back(lap);
}

// Laps that tell no distance get the one that their points tell.
void measureLaps(WorkoutActivity& activity) {
  double before = 0;
  for (Lap& lap : activity.laps) {
    double after = before;
    for (const TrackPoint& point : pointsIn(activity, lap.points)) after = point.distance.value_or(after);
    const bool startedAnew = after < before;  // some devices count each lap from 0
    if (lap.metres == 0) lap.metres = startedAnew ? after : after - before;
    before = after;
  }
}

// `counted` is the distance at which the activity before ended, by a count that may go on through the file.
WorkoutActivity readActivity(pugi::xml_node node, const std::string& author, double& counted) {
  WorkoutActivity activity;
  activity.title = lineOf(textOf(childNamed(node, "Notes")));
  activity.sport = sportNamed(node.attribute("Sport").value());
  activity.sourceName = lineOf(textOf(childAt(node, "Creator/Name")));
  if (activity.sourceName.empty()) activity.sourceName = author;
  for (const pugi::xml_node lap : childrenNamed(node, "Lap")) appendLap(lap, activity);
  const double end = lastDistance(activity);
  beginDistancesAtZero(activity, counted);
  counted = end;
  fillDistances(activity);
  fillTimes(activity);
  measureLaps(activity);
  completeFigures(activity);
  return activity;
}

}  // namespace

// An activity stands directly below Activities, or two levels down as one leg of a session.
std::vector<WorkoutActivity> readTcx(pugi::xml_node root) {
  std::vector<WorkoutActivity> activities;
  const std::string author = lineOf(textOf(childAt(root, "Author/Name")));
  double counted = 0;
  for (const pugi::xml_node node : childNamed(root, "Activities")) {
    if (localName(node) == "Activity") activities.push_back(readActivity(node, author, counted));
    if (localName(node) != "MultiSportSession") continue;
    for (const pugi::xml_node leg : node) {
      for (const auto part : childrenNamed(leg, "Activity"))
        activities.push_back(readActivity(part, author, counted));
    }
  }
  return activities;
}

}  // namespace ax::reader
