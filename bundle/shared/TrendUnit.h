#pragma once

#include <cstdint>

#include "bundle/core/Export.h"
#include "platform/health/Unit.h"

// The unit in which a trend of this type is measured, made anew at each call; nil for a type above 8. Main
// thread only.
AX_EXPORT ax::Ref<ax::Unit> accessibilityQSUnitForTrendType(std::uint64_t type);
