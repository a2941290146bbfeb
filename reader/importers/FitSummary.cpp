#include "reader/importers/FitSummary.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <iterator>

#include "reader/importers/RouteMeasures.h"
#include "reader/importers/XmlFields.h"

namespace ax::reader {
namespace {

constexpr int startField = 2;
constexpr int elapsedField = 7;
constexpr int timerField = 8;
constexpr int distanceField = 9;
constexpr double milli = 1000;
constexpr double centi = 100;
constexpr double wholeCircle = 4294967296.0;  // in the angles of the format

struct MeasureField {
  int session;
  int lap;
  std::optional<double> Measures::*measure;
};

constexpr MeasureField measureFields[] = {
    {11, 11, &Measures::kilocalories},     {16, 15, &Measures::averageHeartRate},
    {17, 16, &Measures::maximumHeartRate}, {18, 17, &Measures::averageCadence},
    {20, 19, &Measures::averagePower},     {21, 20, &Measures::maximumPower},
    {22, 21, &Measures::elevationGain},
};

std::optional<double> aboveZero(std::optional<double> value) {
  return value && *value > 0 ? value : std::nullopt;
}

std::optional<double> within(std::optional<double> value, NumberLimits limits) {
  return value && *value >= limits.least && *value <= limits.most ? value : std::nullopt;
}

std::optional<float> shortOf(std::optional<double> value) {
  return value ? std::optional(static_cast<float>(*value)) : std::nullopt;
}

bool isRestIntensity(int intensity) {
  constexpr int rest = 1;
  constexpr int recovery = 4;
  return intensity == rest || intensity == recovery;
}

void readSessionFields(const FitMessage& message, FitSummary& summary) {
  constexpr double yards = 1;
  summary.sport = fitCode(message, 5);
  summary.subSport = fitCode(message, 6);
  summary.poolMetres = aboveZero(message.scaled(44, centi));
  summary.isPoolInYards = message.number(46) == yards;
}

std::optional<double> angle(const FitMessage& message, int field, NumberLimits limits) {
  const auto value = message.number(field);
  return value ? within(*value * 360 / wholeCircle, limits) : std::nullopt;
}

// The newer field has more room; the older one may stand beside it.
std::optional<double> altitudeOf(const FitMessage& message) {
  constexpr double least = 500;
  const auto newer = message.scaled(78, 5);
  const auto value = newer ? newer : message.scaled(2, 5);
  return value ? std::optional(*value - least) : std::nullopt;
}

std::optional<double> cadenceOf(const FitMessage& message) {
  const auto whole = message.number(4);
  return whole ? std::optional(*whole + message.scaled(53, 128).value_or(0)) : std::nullopt;
}

struct FitSport {
  int sport;
  std::string_view name;
};
constexpr FitSport sports[] = {
    {1, "running"}, {2, "cycling"}, {3, "transition"}, {5, "swimming"},    {11, "walking"},
    {15, "rowing"}, {17, "hiking"}, {21, "cycling"},   {65, "wheelchair"}, {66, "wheelchair"},
};
// Training is told by its kind alone.
constexpr FitSport subSports[] = {{20, "strength"}, {43, "yoga"}, {14, "rowing"}};

constexpr std::array<std::string_view, 7> strokes = {"freestyle", "backstroke", "breaststroke", "butterfly",
                                                     "drill",     "mixed",      "medley"};

}  // namespace

int fitCode(const FitMessage& message, int field) {
  const double code = message.number(field).value_or(0);
  return code >= 0 && code < 0xFF ? static_cast<int>(code) : 0;
}

FitSummary readFitSummary(const FitMessage& message) {
  const bool isSession = message.kind() == FitKind::session;
  FitSummary summary;
  summary.start = message.instant(startField);
  summary.end = message.time();
  summary.elapsed = within(message.scaled(elapsedField, milli), notNegative);
  summary.timer = within(message.scaled(timerField, milli), notNegative);
  summary.metres = within(message.scaled(distanceField, centi), notNegative);
  for (const MeasureField& each : measureFields) {
    summary.told.*each.measure = aboveZero(message.number(isSession ? each.session : each.lap));
  }
  if (isSession) readSessionFields(message, summary);
  summary.isRest = !isSession && isRestIntensity(fitCode(message, 23));
  return summary;
}

std::optional<TrackPoint> readFitRecord(const FitMessage& message) {
  if (!message.time()) return std::nullopt;
  TrackPoint point;
  point.time = *message.time();
  point.latitude = angle(message, 0, latitudes);
  point.longitude = angle(message, 1, longitudes);
  point.distance = within(message.scaled(5, centi), notNegative);
  point.heartRate = shortOf(within(message.number(3), heartRates));
  point.altitude = shortOf(within(altitudeOf(message), altitudes));
  point.cadence = shortOf(within(cadenceOf(message), cadences));
  point.power = shortOf(within(message.number(7), powers));
  dropFalsePosition(point);
  return point;
}

std::optional<PoolLength> readFitLength(const FitMessage& message) {
  const auto start = message.instant(startField);
  const auto begin = start ? start : message.time();
  if (!begin) return std::nullopt;
  PoolLength length;
  length.start = *begin;
  const auto timer = message.scaled(4, milli);
  length.seconds = std::max(0.0, timer ? *timer : message.scaled(3, milli).value_or(0));
  length.isRest = message.number(12) == 0;
  const auto stroke = static_cast<std::size_t>(fitCode(message, 7));
  if (message.number(7) && stroke < strokes.size()) length.stroke = strokes[stroke];
  return length;
}

std::string fitSportName(int sport, int subSport) {
  const auto bySub = std::ranges::find(subSports, subSport, &FitSport::sport);
  if (bySub != std::end(subSports)) return std::string(bySub->name);
  const auto found = std::ranges::find(sports, sport, &FitSport::sport);
  return found == std::end(sports) ? "other" : std::string(found->name);
}

}  // namespace ax::reader
