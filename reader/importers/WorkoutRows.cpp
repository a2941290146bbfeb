#include "reader/importers/WorkoutRows.h"

#include <algorithm>
#include <cmath>
#include <iterator>

#include "platform/formatting/CalendarMath.h"
#include "platform/health/Workout.h"

namespace ax::reader {

using Json = nlohmann::ordered_json;

namespace {

constexpr const char* recordId = "workout";

struct Height {
  static constexpr double header = 40, listRow = 64, summary = 160, twoValues = 60, pace = 60, split = 44,
                          chart = 180, map = 200;
};

struct Figure {
  std::string titleKey;
  Json value;
};

// Pauses included. The cell takes a time as that of a workout.
Json elapsedTime(const WorkoutActivity& activity) {
  return sceneObject("Workout", {{"duration", activity.duration}});
}

// As it is said: what rounds to the same is not said twice.
bool hasPauses(const WorkoutActivity& activity) {
  return std::round(activity.duration) > std::round(activity.activeSeconds);
}

struct CadenceRow {
  std::string_view sport;
  const char* titleKey;
  const char* unit;
  double times;  // files count the steps of one foot
};
constexpr CadenceRow cadences[] = {{"cycling", "figure.average.cadence", "rev/min", 1},
                                   {"running", "figure.average.step.rate", "step/min", 2},
                                   {"walking", "figure.average.step.rate", "step/min", 2},
                                   {"hiking", "figure.average.step.rate", "step/min", 2},
                                   {"swimming", "figure.average.stroke.rate", "stroke/min", 1},
                                   {"rowing", "figure.average.stroke.rate", "stroke/min", 1}};

struct MeasureRow {
  const char* titleKey;
  std::optional<double> Measures::*measure;
  const char* unit;
};
constexpr MeasureRow measureRows[] = {
    {"figure.average.heart.rate", &Measures::averageHeartRate, "count/min"},
    {"figure.maximum.heart.rate", &Measures::maximumHeartRate, "count/min"},
    {"figure.average.power", &Measures::averagePower, "W"},
    {"figure.maximum.power", &Measures::maximumPower, "W"},
};

// What the summary does not say already.
std::vector<Figure> figuresOf(const WorkoutActivity& activity, const DistanceUnit& unit) {
  std::vector<Figure> figures;
  if (activity.start != 0) figures.push_back({"figure.started", sceneDate(activity.start)});
  if (hasPauses(activity)) figures.push_back({"figure.total.time", elapsedTime(activity)});
  if (const double gain = activity.measures.elevationGain.value_or(0); gain >= 0.5) {
    figures.push_back({"figure.elevation.gain", distanceQuantity(gain, heightUnitFor(unit))});
  }
  for (const auto& [titleKey, measure, unitName] : measureRows) {
    const auto& value = activity.measures.*measure;
    if (value) figures.push_back({titleKey, sceneQuantity(*value, unitName)});
  }
  const auto cadence = std::ranges::find(cadences, activity.sport, &CadenceRow::sport);
  if (activity.measures.averageCadence && cadence != std::end(cadences)) {
    const double turns = *activity.measures.averageCadence * cadence->times;
    figures.push_back({cadence->titleKey, sceneQuantity(turns, cadence->unit)});
  }
  return figures;
}

// The place of a second figure stays empty when there is none.
Json twoValues(const Figure& first, const Figure* second) {
  return sceneObject("CHWorkoutDetailTwoValueTableViewCell",
                     {{"title1", appText(first.titleKey)},
                      {"value1", first.value},
                      {"title2", second != nullptr ? appText(second->titleKey) : Json("")},
                      {"value2", second != nullptr ? second->value : Json("")}});
}

Json splitRow(const Lap& lap, std::size_t number, const WorkoutActivity& activity, const DistanceUnit& unit) {
  Json split = {{"index", number},
                {"duration", lap.seconds},
                {"activityType", workoutActivityTypeNamed(activity.sport)},
                {"isRest", lap.isRest}};
  if (lap.metres > 0) split["distance"] = distanceQuantity(lap.metres, unit);
  return sceneObject("CHWorkoutSplit", std::move(split));
}

Json lengthRow(const PoolLength& length, std::size_t number, const WorkoutActivity& activity,
               const DistanceUnit& unit) {
  const Lap lap{.start = length.start,
                .seconds = length.seconds,
                .metres = length.isRest ? 0 : activity.poolMetres,
                .isRest = length.isRest,
                .told = {},
                .points = {}};
  Json split = splitRow(lap, number, activity, unit);
  split["set"]["isLength"] = true;
  if (!length.stroke.empty()) split["set"]["stroke"] = appText("stroke." + length.stroke);
  return split;
}

// Lengths of a pool, else laps. A single one would say again what the summary says.
std::vector<Json> splitsOf(const WorkoutActivity& activity, const DistanceUnit& unit) {
  std::vector<Json> splits;
  if (activity.metres <= 0) return splits;
  if (activity.poolMetres > 0) {
    std::size_t swum = 0;
    for (const PoolLength& length : activity.lengths) {
      if (!length.isRest) ++swum;
      splits.push_back(lengthRow(length, swum, activity, unit));
    }
  }
  if (splits.empty()) {
    for (const Lap& lap : activity.laps) splits.push_back(splitRow(lap, splits.size() + 1, activity, unit));
  }
  if (splits.size() == 1) splits.clear();
  return splits;
}

void addSplits(SceneRows& rows, const WorkoutActivity& activity, const DistanceUnit& unit) {
  std::vector<Json> splits = splitsOf(activity, unit);
  if (splits.empty()) return;
  rows.add(sceneObject("CHWorkoutDetailExpandingHeaderView",
                       {{"_titleLabel", sceneLabel(appText("split.title"))},
                        {"_expandButton", sceneObject("Button", Json::object())},
                        {"_expanded", true}},
                       "splits"),
           Height::header);
  for (Json& split : splits) {
    rows.add(sceneObject("CHWorkoutDetailSplitTableViewCell", {{"split", std::move(split)}}), Height::split);
  }
}

Json heartRateRow(const WorkoutActivity& activity) {
  Json chart = sceneObject(
      "CHWorkoutDetailHeartRateChartView",
      {{"_workout", sceneReference(recordId)}, {"_heartRateReadings", heartRateReadings(activity)}},
      "heart-rate");
  return sceneObject("CHWorkoutDetailHeartRateChartTableViewCell", {{"_chartView", std::move(chart)}});
}

Json mapRow(const WorkoutActivity& activity) {
  Json title = appText("workout.route");
  if (!activity.title.empty()) {
    title = appText("workout.route.named");
    title["with"] = Json::array({activity.title});
  }
  Json map = sceneObject("_CHWorkoutDetailMapView", {{"_titleLabel", sceneLabel(std::move(title))}}, "map");
  return sceneObject("CHWorkoutDetailMapAndWeatherTableViewCell", {{"_mapView", std::move(map)}});
}

int monthOf(const ListedActivity& listed) {
  const formatting::CalendarFields fields = formatting::calendarFields(listed.activity->start);
  return fields.year * 12 + fields.month;
}

Json monthHeader(const ListedActivity& first, std::ptrdiff_t count) {
  return sceneObject("CHWorkoutListTableHeaderView",
                     {{"month", sceneDate(first.activity->start)}, {"numberOfWorkouts", count}});
}

}  // namespace

void addDetailRows(SceneRows& rows, const WorkoutActivity& activity, const DistanceUnit& unitOfRegion) {
  const DistanceUnit unit = distanceUnitOf(activity, unitOfRegion);
  rows.add(sceneObject("CHWorkoutSummaryTableViewCell",
                       {{"workouts", Json::array({workoutRecord(activity, unit, recordId)})}}, "summary"),
           Height::summary);
  const std::vector<Figure> figures = figuresOf(activity, unit);
  for (std::size_t i = 0; i < figures.size(); i += 2) {
    rows.add(twoValues(figures[i], i + 1 < figures.size() ? &figures[i + 1] : nullptr), Height::twoValues);
  }
  if (activity.metres > 0) {
    rows.add(sceneObject("CHWorkoutDetailPaceTableViewCell", {{"workout", sceneReference(recordId)}}, "pace"),
             Height::pace);
  }
  addSplits(rows, activity, unit);
  rows.add(heartRateRow(activity), Height::chart);
  if (activity.hasRoute) rows.add(mapRow(activity), Height::map);
}

void addListRows(SceneRows& rows, std::vector<ListedActivity> activities) {
  std::ranges::stable_sort(activities, std::ranges::greater(),
                           [](const ListedActivity& listed) { return listed.activity->start; });
  for (auto month = activities.begin(); month != activities.end();) {
    const auto end = std::find_if(month, activities.end(),
                                  [&](const auto& each) { return monthOf(each) != monthOf(*month); });
    rows.add(monthHeader(*month, end - month), Height::header);
    for (; month != end; ++month) {
      rows.add(sceneObject("CHWorkoutsListTableViewCell", {{"workout", month->record}}), Height::listRow);
    }
  }
}

}  // namespace ax::reader
