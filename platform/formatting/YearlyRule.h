// Internal to this folder: the changes of clocks that come every year.
#pragma once

#include <array>
#include <optional>
#include <string_view>

#include "platform/formatting/ZoneRules.h"

namespace ax::formatting {

// A stretch of time with one offset, as the system marks it; see ZoneRange.
struct MarkedStretch {
  double from = -kEver;
  double to = kEver;
  double offset = 0;
  bool marked = false;  // as daylight saving
};

class YearlyRule {
 public:
  // Reads what the last line of a zone's file says, such as "EST5EDT,M3.2.0,M11.1.0" or
  // "<-02>2<-01>,M3.5.0/-1,M10.5.0/0": offsets west of Greenwich, then month, week and weekday with the hour
  // at which the marked offset begins and ends. Nothing when there are no two changes a year, or they are
  // told in another way.
  static std::optional<YearlyRule> read(std::string_view line);

  MarkedStretch at(double time) const;

 private:
  struct Change {
    unsigned month = 0;
    unsigned week = 0;  // 1 to 5; the fifth is the last
    unsigned weekday = 0;
    double inDay = 0;  // seconds from the local midnight; may lie in another day
  };
  struct Instant {
    double time;
    bool marked;  // from then on
  };

  double instantOf(const Change& change, int year, double formerOffset) const;
  std::array<Instant, 6> changesAround(double time) const;

  double standard_ = 0;
  double marked_ = 0;
  Change begin_;
  Change end_;

  friend class RuleReader;
};

}  // namespace ax::formatting
