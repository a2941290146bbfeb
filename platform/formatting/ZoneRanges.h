// Internal to this folder: the clock of the current zone, as stretches of time with one offset.
// Main thread only.
#pragma once

namespace ax::formatting {

// All in seconds; the stretch is from <= time < to.
struct ZoneRange {
  double from;
  double to;
  double offset;        // local minus UTC
  double daylight;      // the part of it that is daylight saving
  double formerOffset;  // the offset just before `from`
};

// The stretch that holds `time`, which must be finite. The reference is valid until the next call.
const ZoneRange& zoneRangeAt(double time);

enum class RepeatedTime { first, last };

// The instant at which clocks show `local` (seconds since 1970-01-01T00:00:00 as if it were UTC). Of a
// time that comes twice, the one asked for; a time that clocks skip is counted on from before the gap.
double instantOfLocal(double local, RepeatedTime which);

}  // namespace ax::formatting
