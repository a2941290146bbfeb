#include "reader/importers/FitFile.h"

#include <algorithm>
#include <cmath>
#include <limits>

#include "reader/importers/FitSummary.h"
#include "reader/importers/PointFigures.h"
#include "reader/importers/RouteMeasures.h"
#include "reader/importers/XmlFields.h"

namespace ax::reader {
namespace {

constexpr double ever = std::numeric_limits<double>::infinity();

bool isWithin(double time, double from, double to) {
  return time >= from && time < to;
}

// What one file holds, in its order.
struct FitRecords {
  std::vector<FitSummary> sessions;
  std::vector<FitSummary> laps;
  std::vector<TrackPoint> points;
  std::vector<std::size_t> resumed;  // indexes of the first points after a pause
  std::vector<PoolLength> lengths;
  std::string product;
  int sport = 0;
  int subSport = 0;
  std::optional<double> secondsEastOfUtc;
  bool isStopped = false;

  void take(const FitMessage& message, std::size_t bytesLeft);

 private:
  void takeRecord(const FitMessage& message, std::size_t bytesLeft);
  void takeTimerEvent(const FitMessage& message);
  void takeNames(const FitMessage& message);
  void takeLocalTime(const FitMessage& message);
};

void FitRecords::takeRecord(const FitMessage& message, std::size_t bytesLeft) {
  const auto point = readFitRecord(message);
  if (!point) return;
  // Points grow to as many as the rest has room for, rather than by doubling what is there.
  constexpr std::size_t bytesPerPoint = 12;
  if (points.size() == points.capacity() && message.size() >= bytesPerPoint) {
    points.reserve(points.size() + 1 + bytesLeft / message.size());
  }
  points.push_back(*point);
}

void FitRecords::takeTimerEvent(const FitMessage& message) {
  constexpr double timer = 0;
  if (message.number(0) != timer) return;
  const double kind = message.number(1).value_or(-1);
  const bool stops = kind == 1 || kind == 4 || kind == 8 || kind == 9;
  if (kind == 0 && isStopped && !points.empty()) resumed.push_back(points.size());
  if (kind == 0 || stops) isStopped = stops;
}

void FitRecords::takeNames(const FitMessage& message) {
  const int productName = message.kind() == FitKind::fileId ? 8 : 27;
  if (product.empty()) product = lineOf(message.text(productName));
}

// The whole quarters of an hour that the local clock is ahead of the world's.
void FitRecords::takeLocalTime(const FitMessage& message) {
  constexpr double quarter = 900;
  constexpr double most = 14 * 3600.0;
  const auto local = message.instant(5);
  if (!message.time() || !local) return;
  const double ahead = std::round((*local - *message.time()) / quarter) * quarter;
  if (std::abs(ahead) <= most) secondsEastOfUtc = ahead;
}

void FitRecords::take(const FitMessage& message, std::size_t bytesLeft) {
  switch (message.kind()) {
    case FitKind::record:
      return takeRecord(message, bytesLeft);
    case FitKind::session:
      return sessions.push_back(readFitSummary(message));
    case FitKind::lap:
      return laps.push_back(readFitSummary(message));
    case FitKind::event:
      return takeTimerEvent(message);
    case FitKind::length:
      if (auto length = readFitLength(message)) lengths.push_back(std::move(*length));
      return;
    case FitKind::sport:
      sport = fitCode(message, 0);
      subSport = fitCode(message, 1);
      return;
    case FitKind::activity:
      return takeLocalTime(message);
    case FitKind::fileId:
    case FitKind::deviceInfo:
      return takeNames(message);
    default:
      return;
  }
}

Lap lapOf(const FitSummary& summary, double start) {
  Lap lap;
  lap.start = start;
  lap.seconds = summary.timer.value_or(summary.elapsed.value_or(0));
  lap.metres = summary.metres.value_or(0);
  lap.isRest = summary.isRest;
  lap.told = summary.told;
  return lap;
}

void addLaps(const FitRecords& file, double from, double to, WorkoutActivity& activity) {
  for (const FitSummary& summary : file.laps) {
    const auto start = summary.start ? summary.start : summary.end;
    if (start && isWithin(*start, from, to)) activity.laps.push_back(lapOf(summary, *start));
  }
  for (const PoolLength& length : file.lengths) {
    if (isWithin(length.start, from, to)) activity.lengths.push_back(length);
  }
}

// The points of the time, divided where the timer ran again; moved when they are all of the file.
void addPoints(FitRecords& file, double from, double to, WorkoutActivity& activity) {
  std::vector<std::size_t> starts;
  if (from == -ever && to == ever) {
    activity.points = std::move(file.points);
    starts = file.resumed;
  } else {
    auto next = file.resumed.begin();
    for (std::size_t i = 0; i < file.points.size(); ++i) {
      const bool isResumed = next != file.resumed.end() && *next == i;
      if (isResumed) ++next;
      if (!isWithin(file.points[i].time, from, to)) continue;
      if (isResumed && !activity.points.empty()) starts.push_back(activity.points.size());
      activity.points.push_back(file.points[i]);
    }
  }
  starts.push_back(activity.points.size());
  std::size_t first = 0;
  for (const std::size_t end : starts) {
    if (end > first) activity.segments.push_back({first, end - first});
    first = end;
  }
}

void takeSessionFigures(const FitSummary& session, WorkoutActivity& activity) {
  activity.measures = session.told;
  activity.activeSeconds = session.timer.value_or(0);
  activity.metres = session.metres.value_or(0);
  activity.poolMetres = session.poolMetres.value_or(0);
  activity.isPoolInYards = session.isPoolInYards;
  if (session.start) {
    const double end = std::max(activity.start + activity.duration, session.end.value_or(0));
    activity.start = *session.start;
    activity.duration = std::max(session.elapsed.value_or(0), end - activity.start);
  }
}

WorkoutActivity activityOf(FitRecords& file, const FitSummary& session, double from, double to) {
  WorkoutActivity activity;
  const bool isTold = session.sport != 0 || session.subSport != 0;
  activity.sport =
      isTold ? fitSportName(session.sport, session.subSport) : fitSportName(file.sport, file.subSport);
  activity.sourceName = file.product;
  activity.secondsEastOfUtc = file.secondsEastOfUtc;
  addLaps(file, from, to, activity);
  addPoints(file, from, to, activity);
  fillDistances(activity);
  fillTimes(activity);
  takeSessionFigures(session, activity);
  completeFigures(activity);
  return activity;
}

std::vector<WorkoutActivity> activitiesOf(FitRecords file) {
  std::vector<FitSummary> sessions = std::move(file.sessions);
  std::erase_if(sessions, [](const FitSummary& each) { return !each.start; });
  if (sessions.empty()) sessions.emplace_back();
  std::ranges::stable_sort(sessions, {}, [](const FitSummary& each) { return each.start.value_or(0); });
  std::vector<WorkoutActivity> activities;
  for (std::size_t i = 0; i < sessions.size(); ++i) {
    const double from = i == 0 ? -ever : *sessions[i].start;
    const double to = i + 1 == sessions.size() ? ever : *sessions[i + 1].start;
    if (fitSportName(sessions[i].sport, 0) == "transition") continue;
    activities.push_back(activityOf(file, sessions[i], from, to));
  }
  return activities;
}

}  // namespace

FitContent readFit(std::string_view bytes) {
  FitContent content;
  FitRecords current;
  const auto finish = [&] {
    if (current.points.empty() && current.laps.empty() && current.sessions.empty()) return;
    for (WorkoutActivity& each : activitiesOf(std::move(current)))
      content.activities.push_back(std::move(each));
  };
  FitVisitor visitor;
  visitor.onFile = [&] {
    finish();
    current = {};
  };
  visitor.onMessage = [&](const FitMessage& message) { current.take(message, message.bytesLeft(bytes)); };
  content.fault = readFitMessages(bytes, visitor);
  finish();
  return content;
}

}  // namespace ax::reader
