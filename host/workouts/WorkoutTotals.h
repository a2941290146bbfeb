#pragma once

#include "host/workouts/CHWorkoutSummaryTabbedLabelContainer.h"
#include "platform/foundation/Array.h"
#include "platform/health/Workout.h"

namespace ax::host {

// What several workouts come to. Distances and energies count in the unit of the first that has one.
struct WorkoutTotals {
  explicit WorkoutTotals(const Ref<Array>& workouts);

  std::size_t count = 0;
  double seconds = 0;
  Ref<Quantity> distance;  // nil when no workout has one
  Ref<Quantity> energy;
  double pacedSeconds = 0;  // of the workouts that count for the pace: those on foot, with a distance
  Ref<Quantity> pacedDistance;
};

// A total, and from two workouts on the average, in a container that hides when there is no total.
void showFigure(CHWorkoutSummaryTabbedLabelContainer& container, std::string_view titleKey,
                const Ref<Quantity>& total, std::size_t count);
void showDuration(CHWorkoutSummaryTabbedLabelContainer& container, double seconds, std::size_t count);
void showPace(CHWorkoutSummaryTabbedLabelContainer& container, const WorkoutTotals& totals);

}  // namespace ax::host
