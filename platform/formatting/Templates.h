// Internal to this folder: what is asked of a date as fields, made fit to be spoken.
#pragma once

#include <string>
#include <string_view>

namespace ax::formatting {

// The skeleton of a template for the current region: hours by the region's clock of 12 or 24, names of months
// and weekdays in full. Only letters count; a zone has no effect. "hxa" gives "j", "EEEdMMM" "EEEEdMMMM".
std::string spokenSkeleton(std::string_view dateTemplate);

// Whether a skeleton tells the time of day, and the day.
bool tellsTime(std::string_view skeleton);
bool tellsDay(std::string_view skeleton);

// A written date as the current language says it: "1er mars" in French, which counts all other days plainly,
// and the halves of the day as words in Arabic, which writes letters.
std::string asSpoken(std::string date);

// "09–12" as it is said: "9–12". A zero after anything but a blank or a dash counts minutes and stays.
std::string withoutLeadingZeros(std::string times);

}  // namespace ax::formatting
