// Points in time as ISO 8601 text. Times are seconds since 1970-01-01T00:00:00Z. Main thread only.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace ax::formatting {

// Reads "2026-03-08T14:30:00", with an optional fraction of a second and an optional "Z", "+02:00" or
// "+0200"; without an offset it is local time in the current zone. A local time that clocks skip is
// counted on from before the gap, and of one that comes twice the later is meant. A date alone is
// the first instant of that local day. Anything else is nothing, "2026-02-30" and "25:00" included.
std::optional<double> timeFromIso(std::string_view text);

// Local time without its offset, down to whole seconds: "2026-03-08T14:30:00".
std::string isoFromTime(double time);

// The same instant with the offset, which is rounded to whole minutes: "2026-03-08T14:30:00-04:00".
std::string isoWithOffset(double time);

}  // namespace ax::formatting
