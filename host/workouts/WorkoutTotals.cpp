#include "host/workouts/WorkoutTotals.h"

#include "host/workouts/CHWorkoutDataCalculator.h"
#include "host/workouts/WorkoutFigures.h"
#include "platform/foundation/Formatters.h"

namespace ax::host {

namespace {

void addTo(Ref<Quantity>& sum, const Ref<Quantity>& more) {
  if (!more) return;
  sum = sum ? quantity(sum->value() + more->doubleValueForUnit(sum->unit()), sum->unit()) : more;
}

bool countsForPace(const Workout& workout) {
  return workout.totalDistance() && workout.totalDistance()->value() > 0 &&
         workout.workoutActivityType() != WorkoutActivityTypeCycling;
}

Ref<String> spokenClock(double seconds) {
  return textWithSpokenForm(clockText(seconds), durationStringForDuration(seconds));
}

}  // namespace

WorkoutTotals::WorkoutTotals(const Ref<Array>& workouts) {
  if (!workouts) return;
  for (const Ref<Object>& item : *workouts) {
    const Workout* workout = cast<Workout>(item.get());
    if (workout == nullptr) continue;
    ++count;
    seconds += workout->duration();
    addTo(distance, workout->totalDistance());
    addTo(energy, workout->totalEnergyBurned());
    if (!countsForPace(*workout)) continue;
    pacedSeconds += workout->duration();
    addTo(pacedDistance, workout->totalDistance());
  }
}

void showFigure(CHWorkoutSummaryTabbedLabelContainer& container, std::string_view titleKey,
                const Ref<Quantity>& total, std::size_t count) {
  container.setHidden(!total);
  if (!total) return container.show(nullptr, nullptr, nullptr);
  const Ref<Quantity> average = quantity(total->value() / static_cast<double>(count), total->unit());
  container.show(hostText(titleKey), plainText(figureOf(total)),
                 count > 1 ? plainText(figureOf(average)) : nullptr);
}

void showDuration(CHWorkoutSummaryTabbedLabelContainer& container, double seconds, std::size_t count) {
  container.setHidden(count == 0);
  container.show(hostText("figure.total.time"), spokenClock(seconds),
                 count > 1 ? spokenClock(seconds / static_cast<double>(count)) : nullptr);
}

void showPace(CHWorkoutSummaryTabbedLabelContainer& container, const WorkoutTotals& totals) {
  container.setHidden(!totals.pacedDistance);
  if (!totals.pacedDistance) return container.show(nullptr, nullptr, nullptr);
  const double pace = CHWorkoutDataCalculator::pace(totals.pacedDistance, totals.pacedSeconds);
  const Ref<Unit> unit = CHWorkoutDataCalculator::unitOf(totals.pacedDistance);
  container.show(hostText("pace.title"), nullptr,
                 textWithSpokenForm(paceFigure(pace, *unit)->description(), spokenPace(pace, *unit)));
}

}  // namespace ax::host
