#pragma once

#include "reader/importers/WorkoutFile.h"

namespace ax::reader {

// Fills in what the file did not tell of an activity as a whole: from its laps, else from its points.
void completeFigures(WorkoutActivity& activity);

// Seconds of the segments, without the times in which nobody moved for more than half a minute and no point
// was written.
double movingSeconds(const WorkoutActivity& activity);

// Metres climbed, as the altitudes of the points tell once their noise is smoothed; empty without altitudes.
std::optional<double> climbedMetres(const std::vector<TrackPoint>& points);

// Counts the distances of a file whose activities share one count from the start of this activity.
void beginDistancesAtZero(WorkoutActivity& activity, double formerEnd);

}  // namespace ax::reader
