#include "reader/importers/PointFigures.h"

#include <algorithm>
#include <cmath>
#include <span>

#include "reader/importers/RouteMeasures.h"

namespace ax::reader {
namespace {

// A reading holds no longer than this, and a longer silence may be a pause.
constexpr double longestSilence = 30;

using Measure = std::optional<double> Measures::*;
using Reading = std::optional<float> TrackPoint::*;

struct AverageRow {
  Measure measure;
  Reading reading;
  bool countsZero;  // pushing nothing is power too; standing still is no cadence
};
constexpr AverageRow averages[] = {
    {&Measures::averageHeartRate, &TrackPoint::heartRate, false},
    {&Measures::averageCadence, &TrackPoint::cadence, false},
    {&Measures::averagePower, &TrackPoint::power, true},
};

struct MaximumRow {
  Measure measure;
  Reading reading;
};
constexpr MaximumRow maxima[] = {{&Measures::maximumHeartRate, &TrackPoint::heartRate},
                                 {&Measures::maximumPower, &TrackPoint::power}};

// Weighted by the laps' times.
std::optional<double> averageOfLaps(const WorkoutActivity& activity, Measure measure) {
  double sum = 0;
  double seconds = 0;
  for (const Lap& lap : activity.laps) {
    if (!(lap.told.*measure)) continue;
    sum += *(lap.told.*measure) * lap.seconds;
    seconds += lap.seconds;
  }
  return seconds > 0 ? std::optional(sum / seconds) : std::nullopt;
}

std::optional<double> sumOfLaps(const WorkoutActivity& activity, Measure measure) {
  std::optional<double> sum;
  for (const Lap& lap : activity.laps) {
    if (lap.told.*measure) sum = sum.value_or(0) + *(lap.told.*measure);
  }
  return sum;
}

std::optional<double> highestOfLaps(const WorkoutActivity& activity, Measure measure) {
  std::optional<double> highest;
  for (const Lap& lap : activity.laps) {
    if (lap.told.*measure) highest = std::max(highest.value_or(0), *(lap.told.*measure));
  }
  return highest;
}

// Each reading counts for half of the time to its neighbours.
class TimeWeighted {
 public:
  void add(double time, double value) {
    if (count_ > 0) {
      const double seconds = std::clamp(time - time_, 0.0, longestSilence);
      sum_ += seconds * (value + value_) / 2;
      seconds_ += seconds;
    }
    plainSum_ += value;
    ++count_;
    time_ = time;
    value_ = value;
  }
  std::optional<double> average() const {
    if (count_ == 0) return std::nullopt;
    return seconds_ > 0 ? sum_ / seconds_ : plainSum_ / static_cast<double>(count_);
  }

 private:
  double time_ = 0, value_ = 0, sum_ = 0, seconds_ = 0, plainSum_ = 0;
  std::size_t count_ = 0;
};

std::optional<double> averageOfPoints(const WorkoutActivity& activity, const AverageRow& row) {
  TimeWeighted average;
  for (const TrackPoint& point : activity.points) {
    const auto& value = point.*row.reading;
    if (value && (row.countsZero || *value > 0)) average.add(point.time, *value);
  }
  const auto result = average.average();
  return result && *result > 0 ? result : std::nullopt;
}

std::optional<double> highestOfPoints(const WorkoutActivity& activity, Reading reading) {
  double highest = 0;
  for (const TrackPoint& point : activity.points)
    highest = std::max<double>(highest, (point.*reading).value_or(0));
  return highest > 0 ? std::optional(highest) : std::nullopt;
}

void fill(std::optional<double>& figure, std::optional<double> value) {
  if (!figure) figure = value;
}

void fillMeasures(WorkoutActivity& activity) {
  Measures& measures = activity.measures;
  fill(measures.kilocalories, sumOfLaps(activity, &Measures::kilocalories));
  for (const AverageRow& row : averages) {
    fill(measures.*row.measure, averageOfLaps(activity, row.measure));
    if (!(measures.*row.measure)) measures.*row.measure = averageOfPoints(activity, row);
  }
  for (const auto& [measure, reading] : maxima) {
    fill(measures.*measure, highestOfLaps(activity, measure));
    if (!(measures.*measure)) measures.*measure = highestOfPoints(activity, reading);
  }
  fill(measures.elevationGain, sumOfLaps(activity, &Measures::elevationGain));
  if (!measures.elevationGain) measures.elevationGain = climbedMetres(activity.points);
}

struct Silence {
  double seconds;
  double metres;
};

// Between neighbours of a segment that both know where they are.
std::vector<Silence> silencesOf(const WorkoutActivity& activity, Silence& rest) {
  std::vector<Silence> silences;
  for (const PointRange& range : activity.segments) {
    const std::span<const TrackPoint> points = pointsIn(activity, range);
    for (std::size_t i = 1; i < points.size(); ++i) {
      const Silence step{points[i].time - points[i - 1].time,
                         metresBetween(points[i - 1], points[i]).value_or(-1)};
      if (step.metres < 0 || step.seconds <= 0) continue;
      if (step.seconds > longestSilence) {
        silences.push_back(step);
      } else {
        rest.seconds += step.seconds;
        rest.metres += step.metres;
      }
    }
  }
  return silences;
}

// The altitudes around each point, averaged over half a minute.
class SmoothedAltitude {
 public:
  explicit SmoothedAltitude(const std::vector<TrackPoint>& points) : points_(points) {}

  // For points in order; empty when the point has no altitude.
  std::optional<double> at(std::size_t index) {
    constexpr double reach = 15;
    if (!points_[index].altitude) return std::nullopt;
    while (end_ < points_.size() && points_[end_].time <= points_[index].time + reach) add(end_++, 1);
    while (first_ < index && points_[first_].time < points_[index].time - reach) add(first_++, -1);
    return count_ > 0 ? sum_ / count_ : double(*points_[index].altitude);
  }

 private:
  void add(std::size_t index, int sign) {
    if (!points_[index].altitude) return;
    sum_ += sign * double(*points_[index].altitude);
    count_ += sign;
  }

  const std::vector<TrackPoint>& points_;
  std::size_t first_ = 0, end_ = 0;
  double sum_ = 0;
  int count_ = 0;
};

}  // namespace

double movingSeconds(const WorkoutActivity& activity) {
  constexpr double standing = 0.3;  // metres a second: what a receiver wanders
  double seconds = 0;
  for (const PointRange& range : activity.segments) seconds += secondsOf(pointsIn(activity, range));
  Silence rest{0, 0};
  const std::vector<Silence> silences = silencesOf(activity, rest);
  const double usual = rest.seconds > 0 ? rest.metres / rest.seconds : 0;
  for (const Silence& silence : silences) {
    if (silence.metres < silence.seconds * std::max(standing, usual / 4)) seconds -= silence.seconds;
  }
  return std::max(seconds, 0.0);
}

// A rise counts once it is higher than the noise that is left, and is then counted whole.
std::optional<double> climbedMetres(const std::vector<TrackPoint>& points) {
  constexpr double noise = 3;
  SmoothedAltitude altitude(points);
  std::optional<double> lowest;
  double climbed = 0;
  double highest = 0;
  bool isRising = false;
  for (std::size_t i = 0; i < points.size(); ++i) {
    const auto now = altitude.at(i);
    if (!now) continue;
    if (!lowest) lowest = highest = *now;
    if (isRising) {
      climbed += std::max(0.0, *now - highest);
      highest = std::max(highest, *now);
      if (*now > highest - noise) continue;
      isRising = false;
      lowest = now;
    }
    lowest = std::min(*lowest, *now);
    if (*now < *lowest + noise) continue;
    isRising = true;
    climbed += *now - *lowest;
    highest = *now;
  }
  return lowest ? std::optional(climbed) : std::nullopt;
}

void beginDistancesAtZero(WorkoutActivity& activity, double formerEnd) {
  const auto told = [](const TrackPoint& point) { return point.distance.has_value(); };
  const auto first = std::ranges::find_if(activity.points, told);
  if (formerEnd <= 0 || first == activity.points.end() || *first->distance < formerEnd) return;
  for (TrackPoint& point : activity.points) {
    if (point.distance) point.distance = std::max(0.0, *point.distance - formerEnd);
  }
}

void completeFigures(WorkoutActivity& activity) {
  const auto any = [&](auto field) {
    return std::ranges::any_of(activity.points, [=](const TrackPoint& p) { return (p.*field).has_value(); });
  };
  activity.hasHeartRate = any(&TrackPoint::heartRate);
  activity.hasRoute = any(&TrackPoint::latitude);
  const bool tellsTime = activity.activeSeconds > 0;
  const bool tellsDistance = activity.metres > 0;
  for (const Lap& lap : activity.laps) {
    if (!tellsTime) activity.activeSeconds += lap.seconds;
    if (!tellsDistance) activity.metres += lap.metres;
  }
  if (activity.activeSeconds == 0) activity.activeSeconds = movingSeconds(activity);
  // Some writers open a segment for every point.
  if (activity.activeSeconds == 0) activity.activeSeconds = activity.duration;
  if (activity.metres == 0) activity.metres = lastDistance(activity);
  fillMeasures(activity);
}

}  // namespace ax::reader
