#pragma once

#include <optional>
#include <span>

#include "reader/importers/WorkoutFile.h"

namespace ax::reader {

// The great-circle distance of two points in metres; empty when either has no position.
std::optional<double> metresBetween(const TrackPoint& from, const TrackPoint& to);

// From the earliest point to the latest, in seconds; 0 for none.
double secondsOf(std::span<const TrackPoint> points);

std::span<const TrackPoint> pointsIn(const WorkoutActivity& activity, PointRange range);

// Drops positions that cannot be meant: half of one, or the exact origin that a receiver writes before it
// knows where it is.
void dropFalsePosition(TrackPoint& point);

// Gives every point with a position its distance along the route, unless the file recorded distances.
void fillDistances(WorkoutActivity& activity);

// Of the last point that has one; 0 where none has.
double lastDistance(const WorkoutActivity& activity);

// The start and duration: of the points, or where there are none, of the laps.
void fillTimes(WorkoutActivity& activity);

}  // namespace ax::reader
