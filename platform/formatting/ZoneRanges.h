// Internal to this folder: the clock of a zone, as stretches of time with one offset.
// Main thread only.
#pragma once

#include <array>
#include <cstddef>
#include <memory>

#include "platform/formatting/ZoneRules.h"

namespace ax::formatting {

enum class RepeatedTime { first, last };

// Remembers the stretches that were asked for last: readings come in runs, so a few serve them.
class ZoneRanges {
 public:
  explicit ZoneRanges(std::unique_ptr<ZoneRules> rules) : rules_(std::move(rules)) {}

  // The stretch that holds `time`, which must be finite. The reference is valid until the next call.
  const ZoneRange& at(double time) {
    const ZoneRange& last = ranges_[last_];
    return last.from <= time && time < last.to ? last : look(time);
  }

  // The instant at which clocks show `local` (seconds since 1970-01-01T00:00:00 as if it were UTC). Of a
  // time that comes twice, the one asked for; a time that clocks skip is counted on from before the gap.
  double instantOfLocal(double local, RepeatedTime which);

 private:
  const ZoneRange& look(double time);

  std::unique_ptr<ZoneRules> rules_;
  std::array<ZoneRange, 32> ranges_{};  // one that is not used yet holds no time
  std::size_t next_ = 0;
  std::size_t last_ = 0;
};

// The current region's. Formatters share it, and keep it beyond a change of the region.
const std::shared_ptr<ZoneRanges>& currentZoneRanges();

inline const ZoneRange& zoneRangeAt(double time) {
  return currentZoneRanges()->at(time);
}

}  // namespace ax::formatting
