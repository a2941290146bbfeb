#pragma once

#include <cstdint>

#include "bundle/core/Export.h"
#include "platform/foundation/Date.h"
#include "platform/foundation/String.h"

// Days and their rings. Main thread only.

// The index of the day that holds a date, under which the host caches that day's activity.
AX_EXPORT std::int64_t CHCacheIndexForDate(const ax::Ref<ax::Date>& date);

// The rings of the day that holds a date, in words; nil for no date, for a day without a summary, and for one
// whose summary has a fraction that is negative or not a number.
AX_EXPORT ax::Ref<ax::String> accessibilityVeltoStringForDate(const ax::Ref<ax::Date>& date,
                                                              bool arePercentagesCapped);
