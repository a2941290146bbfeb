// Internal to this folder: where the rules of a time zone come from. Main thread only.
#pragma once

#include <limits>
#include <memory>
#include <string>

namespace ax::formatting {

// Where a stretch has no end, or no beginning with its sign turned.
inline constexpr double kEver = std::numeric_limits<double>::infinity();

// A stretch of time in which clocks keep one offset; all in seconds, from <= time < to.
struct ZoneRange {
  double from;
  double to;
  double offset;        // local minus UTC
  double daylight;      // the part of it that is daylight saving
  double formerOffset;  // the offset just before `from`
};

class ZoneRules {
 public:
  ZoneRules() = default;
  ZoneRules(const ZoneRules&) = delete;
  ZoneRules& operator=(const ZoneRules&) = delete;
  virtual ~ZoneRules() = default;

  // The stretch that holds `time`, which must be finite.
  virtual ZoneRange rangeAt(double time) const = 0;
};

// Null when the source has no such zone, or cannot be read.
std::unique_ptr<ZoneRules> systemZoneRules(const std::string& name);
std::unique_ptr<ZoneRules> icuZoneRules(const std::string& name);

// The system's rules, and ICU's where the system has none; null when neither knows the zone.
std::unique_ptr<ZoneRules> zoneRules(const std::string& name);

}  // namespace ax::formatting
