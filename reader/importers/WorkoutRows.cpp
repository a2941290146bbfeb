#include "reader/importers/WorkoutRows.h"

#include <algorithm>

#include "platform/formatting/CalendarMath.h"

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
  return sceneObject("Workout",
                     {{"duration", sceneNumber(std::max(activity.duration, activity.activeSeconds))}});
}

// In pairs: an odd one is followed by a heart rate, which is missing when there is none.
std::vector<Figure> figuresOf(const WorkoutActivity& activity, const DistanceUnit& unit) {
  const auto heartRate = heartRateFigures(activity);
  std::vector<Figure> figures = {{"figure.total.time", elapsedTime(activity)}};
  if (activity.metres > 0) figures.push_back({"figure.distance", distanceQuantity(activity.metres, unit)});
  if (activity.kilocalories) {
    figures.push_back({"figure.active.calories", sceneQuantity(*activity.kilocalories, "kcal")});
  }
  if (heartRate) {
    figures.push_back({"figure.average.heart.rate", sceneQuantity(heartRate->average, "count/min")});
  }
  if (figures.size() % 2 == 1 && heartRate) {
    figures.push_back({"figure.maximum.heart.rate", sceneQuantity(heartRate->maximum, "count/min")});
  } else if (figures.size() % 2 == 1) {
    figures.push_back({"figure.average.heart.rate", nullptr});
  }
  return figures;
}

Json twoValues(const Figure& first, const Figure& second) {
  return sceneObject("CHWorkoutDetailTwoValueTableViewCell", {{"title1", appText(first.titleKey)},
                                                              {"value1", first.value},
                                                              {"title2", appText(second.titleKey)},
                                                              {"value2", second.value}});
}

Json splitRow(const Lap& lap, std::size_t number, const DistanceUnit& unit) {
  Json split = {{"index", number}, {"duration", sceneNumber(lap.seconds)}};
  if (lap.metres > 0) split["distance"] = distanceQuantity(lap.metres, unit);
  return sceneObject("CHWorkoutDetailSplitTableViewCell",
                     {{"split", sceneObject("CHWorkoutSplit", std::move(split))}});
}

void addSplits(SceneRows& rows, const WorkoutActivity& activity, const DistanceUnit& unit) {
  if (activity.metres <= 0 || activity.laps.empty()) return;
  rows.add(sceneObject("CHWorkoutDetailExpandingHeaderView",
                       {{"_titleLabel", sceneLabel(appText("split.title"))},
                        {"_expandButton", sceneObject("Button", Json::object())},
                        {"_expanded", true}},
                       "splits"),
           Height::header);
  std::size_t number = 0;
  for (const Lap& lap : activity.laps) rows.add(splitRow(lap, ++number, unit), Height::split);
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

void addDetailRows(SceneRows& rows, const WorkoutActivity& activity, const DistanceUnit& unit) {
  rows.add(sceneObject("CHWorkoutSummaryTableViewCell",
                       {{"workouts", Json::array({workoutRecord(activity, unit, recordId)})}}, "summary"),
           Height::summary);
  const std::vector<Figure> figures = figuresOf(activity, unit);
  for (std::size_t i = 0; i + 1 < figures.size(); i += 2) {
    rows.add(twoValues(figures[i], figures[i + 1]), Height::twoValues);
  }
  if (activity.metres > 0) {
    rows.add(sceneObject("CHWorkoutDetailPaceTableViewCell", {{"workout", sceneReference(recordId)}}, "pace"),
             Height::pace);
  }
  addSplits(rows, activity, unit);
  rows.add(heartRateRow(activity), Height::chart);
  if (hasRoute(activity)) rows.add(mapRow(activity), Height::map);
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
