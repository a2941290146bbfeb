#include "host/workouts/WorkoutTotals.h"

#include <optional>

#include "host/workouts/CHWorkoutDataCalculator.h"
#include "host/workouts/WorkoutFigures.h"
#include "platform/foundation/Formatters.h"

namespace ax::host {

namespace {

bool countsForPace(const Workout& workout) {
  return workout.totalDistance() && workout.totalDistance()->value() > 0;
}

Ref<String> spokenClock(double seconds) {
  return textWithSpokenForm(clockText(seconds), durationStringForDuration(seconds));
}

}  // namespace

void WorkoutTotals::Sum::add(const Ref<Quantity>& more) {
  if (!more) return;
  total = total ? quantity(total->value() + more->doubleValueForUnit(total->unit()), total->unit()) : more;
  ++count;
}

WorkoutTotals::WorkoutTotals(const Ref<Array>& workouts) {
  if (!workouts) return;
  std::optional<std::int64_t> sport;
  bool isMixed = false;
  for (const Ref<Object>& item : *workouts) {
    const Workout* workout = cast<Workout>(item.get());
    if (workout == nullptr) continue;
    ++count;
    seconds += workout->duration();
    distance.add(workout->totalDistance());
    energy.add(workout->totalEnergyBurned());
    if (!countsForPace(*workout)) continue;
    isMixed = isMixed || sport.value_or(workout->workoutActivityType()) != workout->workoutActivityType();
    sport = workout->workoutActivityType();
    pacedSeconds += workout->duration();
    pacedDistance.add(workout->totalDistance());
  }
  pacedActivityType = sport.value_or(0);
  if (isMixed || sport == WorkoutActivityTypeCycling) pacedDistance = {};
}

void showFigure(CHWorkoutSummaryTabbedLabelContainer& container, std::string_view titleKey,
                const WorkoutTotals::Sum& sum) {
  container.setHidden(!sum.total);
  if (!sum.total) return container.show(nullptr, nullptr, nullptr);
  const double mean = sum.total->value() / static_cast<double>(sum.count);
  container.show(hostText(titleKey), plainText(figureOf(sum.total)),
                 sum.count > 1 ? plainText(figureOf(quantity(mean, sum.total->unit()))) : nullptr);
}

void showDuration(CHWorkoutSummaryTabbedLabelContainer& container, double seconds, std::size_t count) {
  container.setHidden(count == 0);
  container.show(hostText("figure.active.time"), spokenClock(seconds),
                 count > 1 ? spokenClock(seconds / static_cast<double>(count)) : nullptr);
}

void showPace(CHWorkoutSummaryTabbedLabelContainer& container, const WorkoutTotals& totals) {
  const Ref<Quantity>& distance = totals.pacedDistance.total;
  container.setHidden(!distance);
  if (!distance) return container.show(nullptr, nullptr, nullptr);
  const ShownPace pace = CHWorkoutDataCalculator::shownPace(
      CHWorkoutDataCalculator::pace(distance, totals.pacedSeconds), distance, totals.pacedActivityType);
  container.show(hostText("pace.title"), nullptr,
                 textWithSpokenForm(paceFigure(pace.seconds, *pace.unit)->description(),
                                    spokenPace(pace.seconds, *pace.unit)));
}

}  // namespace ax::host
