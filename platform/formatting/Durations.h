// Lengths of time in full words of the current language, never abbreviated.
// Main thread only. Nothing here fails.
#pragma once

#include <string>

namespace ax::formatting {

// Hours, minutes and seconds, parts that are zero left out: "1 hour, 5 minutes, 3 seconds";
// "0 minutes" for nothing. Rounded to whole seconds, half away from zero. A length below zero is
// spoken as its amount after the language's minus sign; one without a finite value as nothing.
std::string spokenDuration(double seconds);

// A length counted in hours, as hours and minutes: 2.25 gives "2 hours, 15 minutes". Rounded to
// whole minutes; otherwise as above.
std::string spokenHours(double hours);

}  // namespace ax::formatting
