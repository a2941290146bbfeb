#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace ax::reader {

// What a recorded workout file holds, whatever its format. Plain values: copies are independent.
// Instants are seconds since 1970-01-01 00:00 UTC with fractions, durations are seconds, distances and
// altitudes metres, angles degrees, heart rates beats per minute, power watts. A field that the file lacks,
// or holds nonsense in, is empty.

struct TrackPoint {
  double time = 0;
  std::optional<double> latitude;   // -90 to 90; set together with the longitude or not at all
  std::optional<double> longitude;  // -180 to 180
  // Since the start of the activity. Where no point of the activity carries one, it is measured along the
  // positions, and what was travelled during a pause is left out.
  std::optional<double> distance;
  // Files hold millions of points; these need no more digits.
  std::optional<float> heartRate;  // above 0
  std::optional<float> altitude;
  std::optional<float> cadence;  // turns, steps of one foot or strokes a minute
  std::optional<float> power;
};

// `count` points of an activity's `points`, from index `first` on.
struct PointRange {
  std::size_t first = 0;
  std::size_t count = 0;
};

// What is told of a whole activity or a lap beside its time and distance.
struct Measures {
  std::optional<double> kilocalories;
  std::optional<double> averageHeartRate;  // above 0, as are all that follow
  std::optional<double> maximumHeartRate;
  std::optional<double> averageCadence;  // as the points count it
  std::optional<double> averagePower;
  std::optional<double> maximumPower;
  std::optional<double> elevationGain;
};

struct Lap {
  double start = 0;
  double seconds = 0;   // in motion, pauses left out
  double metres = 0;    // 0 when nobody went anywhere: a lap may have no pace
  bool isRest = false;  // a break between two efforts
  Measures told;
  PointRange points;  // may hold none
};

// One length of a pool, or a rest at its end.
struct PoolLength {
  double start = 0;
  double seconds = 0;
  bool isRest = false;
  std::string stroke;  // freestyle, backstroke, breaststroke, butterfly, drill, mixed, medley; may be empty
};

struct WorkoutActivity {
  std::string title;                       // one line, as its owner named it; may be empty
  std::string sport;                       // as the health store names it: running, cycling ... or other
  std::string sourceName;                  // the device or app that recorded it; may be empty
  std::optional<double> secondsEastOfUtc;  // of the clock that the file was written by
  double start = 0;                        // the earliest point, or where the file says that it began
  double duration = 0;                     // from the start to the end, pauses included
  double activeSeconds = 0;  // pauses left out; the laps' own clock may exceed `duration` by a second
  double metres = 0;         // the file's own figure, the sum of the laps, or the length of the route
  Measures measures;         // the file's own, completed from the laps and then the points
  double poolMetres = 0;     // the length of the pool; 0 when it was none
  bool isPoolInYards = false;
  bool hasHeartRate = false;
  bool hasRoute = false;
  std::vector<TrackPoint> points;    // in the order of the file; times may repeat or go back
  std::vector<PointRange> segments;  // stretches of `points` between pauses, in order; they cover them all
  std::vector<Lap> laps;             // in the order of the file; a format without laps leaves this empty
  std::vector<PoolLength> lengths;   // in the order of the file
};

// Why a file cannot be read, in parts that make one line: "FILE: what, at place, expected ...".
struct WorkoutFileFault {
  std::string file;   // the name that the caller gave
  std::string place;  // "line 12, column 5" (columns count characters), "byte 97", or a path of elements
  std::string what;
  std::string expected;
};

struct WorkoutFile {
  std::vector<WorkoutActivity> activities;  // at least one, and at least one of them has points
  std::optional<WorkoutFileFault> damage;   // of a file that was read as far as it goes
};

}  // namespace ax::reader
