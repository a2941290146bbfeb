#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace ax::reader {

// What a recorded workout file holds, whatever its format. Plain values: copies are independent.
// Instants are seconds since 1970-01-01 00:00 UTC with fractions, durations are seconds, distances metres,
// angles degrees, heart rates beats per minute. A field that the file lacks, or holds nonsense in, is empty.

struct TrackPoint {
  double time = 0;
  std::optional<double> latitude;   // -90 to 90; set together with the longitude or not at all
  std::optional<double> longitude;  // -180 to 180
  // Since the start of the activity. Where no point of the activity carries one, it is measured along the
  // positions, and what was travelled during a pause is left out.
  std::optional<double> distance;
  std::optional<double> heartRate;  // above 0
};

// `count` points of an activity's `points`, from index `first` on.
struct PointRange {
  std::size_t first = 0;
  std::size_t count = 0;
};

struct Lap {
  double start = 0;
  double seconds = 0;  // in motion, pauses left out
  double metres = 0;   // 0 when nobody went anywhere: a lap may have no pace
  std::optional<double> kilocalories;
  PointRange points;  // may hold none
};

struct WorkoutActivity {
  std::string title;         // one line, as its owner named it; may be empty
  std::string sport;         // running, cycling, walking, hiking, swimming, yoga or other
  std::string sourceName;    // the device or app that recorded it; may be empty
  double start = 0;          // the earliest point
  double duration = 0;       // from the earliest point to the latest, pauses included
  double activeSeconds = 0;  // pauses left out; the laps' own clock may exceed `duration` by a second
  double metres = 0;         // the sum of the laps, or the length of the route
  std::optional<double> kilocalories;  // the sum of the laps that tell
  std::vector<TrackPoint> points;      // in the order of the file; times may repeat or go back
  std::vector<PointRange> segments;    // stretches of `points` between pauses, in order; they cover them all
  std::vector<Lap> laps;               // in the order of the file; a format without laps leaves this empty
};

struct WorkoutFile {
  std::vector<WorkoutActivity> activities;  // at least one, and at least one of them has points
};

}  // namespace ax::reader
