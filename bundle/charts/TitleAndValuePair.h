#pragma once

#include "platform/runtime/Object.h"

namespace ax {

inline constexpr const char* titleAndValuePairClassName = "Velto.DayViewTitleAndValueLabelPair";

// The host's title over a value, as one header that reads both texts as they are now. Given back as it came;
// nil stays nil.
Ref<Object> preparedAsHeader(Ref<Object> pair);

}  // namespace ax
