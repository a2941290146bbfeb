#pragma once

#include <optional>
#include <string>

#include "reader/importers/FitMessages.h"
#include "reader/importers/WorkoutFile.h"

namespace ax::reader {

// Numbers of the kinds of messages that are read.
struct FitKind {
  static constexpr int fileId = 0, sport = 12, session = 18, lap = 19, record = 20, event = 21,
                       deviceInfo = 23, activity = 34, length = 101;
};

// What a session or a lap tells of itself.
struct FitSummary {
  std::optional<double> start;
  std::optional<double> end;
  std::optional<double> elapsed;
  std::optional<double> timer;  // pauses left out
  std::optional<double> metres;
  std::optional<double> poolMetres;
  Measures told;
  int sport = 0;
  int subSport = 0;
  bool isRest = false;
  bool isPoolInYards = false;
};

FitSummary readFitSummary(const FitMessage& message);

// A record, if it has a time.
std::optional<TrackPoint> readFitRecord(const FitMessage& message);

// A length of a pool, if it has a time.
std::optional<PoolLength> readFitLength(const FitMessage& message);

// A code of the format; 0 for none.
int fitCode(const FitMessage& message, int field);

// As the health store names it; `transition` between two legs.
std::string fitSportName(int sport, int subSport);

}  // namespace ax::reader
