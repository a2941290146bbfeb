#pragma once

#include "platform/health/Quantity.h"

namespace ax::host {

// A heart rate in beats per minute; 0 for what is none.
double beatsPerMinute(const Quantity& quantity);

}  // namespace ax::host
