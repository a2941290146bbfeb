#pragma once

#include "host/workouts/CHWorkoutSummaryTabbedLabelContainer.h"
#include "platform/foundation/Array.h"
#include "platform/health/Workout.h"

namespace ax::host {

// What several workouts come to. Distances and energies count in the unit of the first that has one.
struct WorkoutTotals {
  // Over the workouts that have such a quantity; nil when none has.
  struct Sum {
    Ref<Quantity> total;
    std::size_t count = 0;
    void add(const Ref<Quantity>& more);
  };

  explicit WorkoutTotals(const Ref<Array>& workouts);

  std::size_t count = 0;
  double seconds = 0;
  Sum distance;
  Sum energy;
  // Of the workouts with a distance, where all of these are of one sport, and no rides; nil otherwise.
  Sum pacedDistance;
  double pacedSeconds = 0;
  std::int64_t pacedActivityType = 0;
};

// A total, and from two workouts on the average, in a container that hides when there is no total.
void showFigure(CHWorkoutSummaryTabbedLabelContainer& container, std::string_view titleKey,
                const WorkoutTotals::Sum& sum);
void showDuration(CHWorkoutSummaryTabbedLabelContainer& container, double seconds, std::size_t count);
void showPace(CHWorkoutSummaryTabbedLabelContainer& container, const WorkoutTotals& totals);

}  // namespace ax::host
