// Points in time as ISO 8601 text. Times are seconds since 1970-01-01T00:00:00Z. Main thread only.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace ax::formatting {

// What a text such as "2026-03-08T14:30:02.250+01:00" says.
struct IsoTime {
  double local = 0;  // seconds since 1970-01-01 by its own clock
  bool hasClock = false;
  bool isUtc = false;                 // "Z"
  std::optional<double> offset = {};  // seconds east of UTC, where the text has an offset
};

// Everything behind the date may be missing, also the seconds, their fraction and the minutes of the offset;
// a blank may stand for the "T". Anything else is nothing, "2026-02-30" and "25:00" included. Any thread.
std::optional<IsoTime> readIso(std::string_view text);

// The instant of such a text. Without an offset it is local time in the current zone: one that clocks skip is
// counted on from before the gap, and of one that comes twice the later is meant. A date alone is the first
// instant of that local day.
std::optional<double> timeFromIso(std::string_view text);

// Local time without its offset, down to whole seconds: "2026-03-08T14:30:00".
std::string isoFromTime(double time);

// The same instant with the offset, which is rounded to whole minutes: "2026-03-08T14:30:00-04:00".
std::string isoWithOffset(double time);

}  // namespace ax::formatting
