// Lengths of time in full words of the current language, never abbreviated.
// Main thread only. Nothing here fails.
#pragma once

#include <string>

namespace ax::formatting {

// Hours, minutes and seconds, parts that are zero left out: "1 hour, 5 minutes, 3 seconds";
// "0 minutes" for nothing. Rounded to whole seconds, half away from zero. Of a length below zero every
// part is: "-1 minute, -1 second". One that is no number or has no end is spoken as no value.
std::string spokenDuration(double seconds);

// The same without hours, however many minutes there are: as a pace is told.
std::string spokenMinutes(double seconds);

// A length counted in hours, as hours and minutes: 2.25 gives "2 hours, 15 minutes". Rounded to
// whole minutes; otherwise as the first.
std::string spokenHours(double hours);

}  // namespace ax::formatting
