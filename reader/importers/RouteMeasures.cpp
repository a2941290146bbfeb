#include "reader/importers/RouteMeasures.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <numbers>

namespace ax::reader {
namespace {

constexpr double earthRadius = 6371008.8;  // metres, the mean

double radians(double degrees) {
  return degrees * std::numbers::pi / 180;
}

}  // namespace

std::optional<double> metresBetween(const TrackPoint& from, const TrackPoint& to) {
  if (!from.latitude || !to.latitude) return std::nullopt;
  const double northward = std::sin(radians(*to.latitude - *from.latitude) / 2);
  const double eastward = std::sin(radians(*to.longitude - *from.longitude) / 2);
  const double narrowing = std::cos(radians(*from.latitude)) * std::cos(radians(*to.latitude));
  const double chord = northward * northward + narrowing * eastward * eastward;
  return 2 * earthRadius * std::asin(std::sqrt(std::min(1.0, chord)));
}

double secondsOf(std::span<const TrackPoint> points) {
  if (points.empty()) return 0;
  const auto [first, last] = std::ranges::minmax_element(points, {}, &TrackPoint::time);
  return last->time - first->time;
}

std::span<const TrackPoint> pointsIn(const WorkoutActivity& activity, PointRange range) {
  return std::span(activity.points).subspan(range.first, range.count);
}

void dropFalsePosition(TrackPoint& point) {
  const bool whole = point.latitude && point.longitude;
  if (whole && (*point.latitude != 0 || *point.longitude != 0)) return;
  point.latitude.reset();
  point.longitude.reset();
}

void fillDistances(WorkoutActivity& activity) {
  if (std::ranges::any_of(activity.points, [](const TrackPoint& p) { return p.distance.has_value(); }))
    return;
  double travelled = 0;
  for (const PointRange& segment : activity.segments) {
    const TrackPoint* former = nullptr;
    for (TrackPoint& point : std::span(activity.points).subspan(segment.first, segment.count)) {
      if (!point.latitude) continue;
      if (former) travelled += metresBetween(*former, point).value_or(0);
      point.distance = travelled;
      former = &point;
    }
  }
}

double lastDistance(const WorkoutActivity& activity) {
  double last = 0;
  for (const TrackPoint& point : activity.points) last = point.distance.value_or(last);
  return last;
}

void fillTimes(WorkoutActivity& activity) {
  double first = std::numeric_limits<double>::infinity();
  double last = -first;
  const auto widen = [&](double from, double to) {
    first = std::min(first, from);
    last = std::max(last, to);
  };
  for (const TrackPoint& point : activity.points) widen(point.time, point.time);
  if (activity.points.empty()) {
    for (const Lap& lap : activity.laps) widen(lap.start, lap.start + lap.seconds);
  }
  if (last < first) return;
  activity.start = first;
  activity.duration = last - first;
}

}  // namespace ax::reader
