#include "reader/importers/GpxFile.h"

#include "reader/importers/PointFigures.h"
#include "reader/importers/RouteMeasures.h"
#include "reader/importers/Sport.h"
#include "reader/importers/XmlFields.h"

namespace ax::reader {
namespace {

struct ExtensionField {
  std::string_view name;
  std::optional<float> TrackPoint::*field;
  NumberLimits limits;
};

constexpr ExtensionField extensionFields[] = {
    {"hr", &TrackPoint::heartRate, heartRates},
    {"cad", &TrackPoint::cadence, cadences},
    {"power", &TrackPoint::power, powers},
    {"PowerInWatts", &TrackPoint::power, powers},
};

// Writers nest them differently: directly, or in an extension element of their own.
void readExtensions(pugi::xml_node node, TrackPoint& point) {
  for (const pugi::xml_node child : node) {
    for (const ExtensionField& each : extensionFields) {
      if (localName(child) == each.name) point.*each.field = parseShort(textOf(child), each.limits);
    }
    readExtensions(child, point);
  }
}

TrackPoint readPoint(pugi::xml_node node, double time) {
  TrackPoint point;
  point.time = time;
  point.latitude = parseNumber(node.attribute("lat").value(), latitudes);
  point.longitude = parseNumber(node.attribute("lon").value(), longitudes);
  point.altitude = parseShort(textOf(childNamed(node, "ele")), altitudes);
  readExtensions(childNamed(node, "extensions"), point);
  dropFalsePosition(point);
  return point;
}

void appendSegment(pugi::xml_node node, WorkoutActivity& activity) {
  PointRange range{.first = activity.points.size()};
  for (const pugi::xml_node point : childrenNamed(node, "trkpt")) {
    const auto time = parseTime(textOf(childNamed(point, "time")));
    if (!time) continue;
    if (activity.points.empty()) activity.secondsEastOfUtc = time->secondsEastOfUtc;
    activity.points.push_back(readPoint(point, time->time));
  }
  range.count = activity.points.size() - range.first;
  if (range.count > 0) activity.segments.push_back(range);
}

WorkoutActivity readTrack(pugi::xml_node node) {
  WorkoutActivity activity;
  activity.title = lineOf(textOf(childNamed(node, "name")));
  activity.sport = sportNamed(textOf(childNamed(node, "type")));
  for (const pugi::xml_node segment : childrenNamed(node, "trkseg")) appendSegment(segment, activity);
  fillDistances(activity);
  fillTimes(activity);
  completeFigures(activity);
  return activity;
}

}  // namespace

std::vector<WorkoutActivity> readGpx(pugi::xml_node root) {
  std::vector<WorkoutActivity> activities;
  for (const pugi::xml_node track : childrenNamed(root, "trk")) {
    WorkoutActivity& activity = activities.emplace_back(readTrack(track));
    if (activity.title.empty()) activity.title = lineOf(textOf(childAt(root, "metadata/name")));
    activity.sourceName = lineOf(root.attribute("creator").value());
  }
  return activities;
}

}  // namespace ax::reader
