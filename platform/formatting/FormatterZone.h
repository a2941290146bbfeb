// Internal to this folder: the current zone as formatters take it.
#pragma once

namespace ax::formatting {

// A new zone of the region's name, with the rules of currentZoneRanges(), that the caller owns. There is one
// for icu::TimeZone; the parameter keeps ICU out of this header. Main thread only.
template <class TimeZone>
TimeZone* newFormatterZone();

}  // namespace ax::formatting
