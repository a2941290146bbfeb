#include "reader/importers/GpxFile.h"

#include "reader/importers/IsoTime.h"
#include "reader/importers/RouteMeasures.h"
#include "reader/importers/Sport.h"
#include "reader/importers/XmlFields.h"

namespace ax::reader {
namespace {

TrackPoint readPoint(pugi::xml_node node, double time) {
  TrackPoint point;
  point.time = time;
  point.latitude = parseNumber(node.attribute("lat").value(), latitudes);
  point.longitude = parseNumber(node.attribute("lon").value(), longitudes);
  // Writers nest it differently: directly, or in an extension element of their own.
  const pugi::xml_node heartRate = descendantNamed(childNamed(node, "extensions"), "hr");
  point.heartRate = parseNumber(textOf(heartRate), heartRates);
  dropFalsePosition(point);
  return point;
}

void appendSegment(pugi::xml_node node, WorkoutActivity& activity) {
  PointRange range{.first = activity.points.size()};
  for (const pugi::xml_node point : childrenNamed(node, "trkpt")) {
    const auto time = parseIsoTime(textOf(childNamed(point, "time")));
    if (time) activity.points.push_back(readPoint(point, *time));
  }
  range.count = activity.points.size() - range.first;
  if (range.count == 0) return;
  activity.activeSeconds += secondsOf(pointsIn(activity, range));
  activity.segments.push_back(range);
}

WorkoutActivity readTrack(pugi::xml_node node) {
  WorkoutActivity activity;
  activity.title = lineOf(textOf(childNamed(node, "name")));
  activity.sport = sportNamed(textOf(childNamed(node, "type")));
  for (const pugi::xml_node segment : childrenNamed(node, "trkseg")) appendSegment(segment, activity);
  fillDistances(activity);
  fillTimes(activity);
  // Some writers open a segment for every point.
  if (activity.activeSeconds == 0) activity.activeSeconds = activity.duration;
  for (const TrackPoint& point : activity.points) activity.metres = point.distance.value_or(activity.metres);
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
