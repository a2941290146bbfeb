// Points in time as the current region writes them, and back. Times are seconds since
// 1970-01-01T00:00:00Z; the calendar is the Gregorian one in the current zone.
// Main thread only. A time that is not finite gives "".
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace ax::formatting {

enum class DateStyle { shortStyle = 1, mediumStyle = 2, longStyle = 3, fullStyle = 4 };

// `pattern` names the fields and their widths, such as "EEEE", "dMMMM" or "EEEE, MMM d, yyyy"; their
// order and what stands between them are the region's: "dMMMM" gives "September 9" in English. Names are
// written in full and hours by the region's clock, since everything is spoken.
std::string dateString(double time, std::string_view pattern);

// All but the short style name the month in full; what the medium one would abbreviate, is spoken too.
std::string dateStyleString(double time, DateStyle style);

// Reads the whole of `text` by `pattern` as it stands ("MM" reads "3", "03" and "12"), in ASCII digits
// or the region's. Fields that are not given come from local noon of 2000-01-01, and years of
// two digits lie between 1950 and 2049. Nothing when the text does not fit or is no date.
std::optional<double> parseDate(std::string_view text, std::string_view pattern);

// Full names of the seven weekdays, Sunday first, as they stand in a sentence or alone. The list is
// valid until the region is set.
const std::vector<std::string>& weekdaySymbols();
const std::vector<std::string>& standaloneWeekdaySymbols();

}  // namespace ax::formatting
