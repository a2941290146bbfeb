// Spans of time as the current region writes them.
#pragma once

#include <string>
#include <string_view>

namespace ax::formatting {

// The span from `start` to `end`, both in seconds since 1970-01-01T00:00:00Z, in the current zone. The
// template names the fields to show: "h:mma", "ha", "MMMMdyyyy". Only its letters count, and a zone
// offset ("x") has no effect; hours follow the region's clock, names are written in full. What both ends
// share is written once: "10 AM – 1 PM", "12 – 3 AM", "10–13 Uhr". Hours of several days name these.
// A span that goes backwards is written as it is given. Ends that are not finite give "".
// Main thread only.
std::string dateIntervalString(double start, double end, std::string_view dateTemplate);

}  // namespace ax::formatting
