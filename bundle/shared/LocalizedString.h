#pragma once

#include <string_view>

#include "bundle/core/Export.h"
#include "platform/foundation/String.h"

// The bundle's own words. Main thread only.

// The text of a key in the reader's language, the same object at every call; the empty text for a key that
// the string table lacks and for every key when the resource files are missing; nil when the bundle itself is
// not there.
AX_EXPORT ax::Ref<ax::String> accessibilityLocalizedString(const ax::Ref<ax::String>& key);

// The spoken title of an achievement; nil for an object that is none.
AX_EXPORT ax::Ref<ax::String> accessibilityLocalizedStringForAchievement(
    const ax::Ref<ax::Object>& achievement);

namespace ax {

// The same for a key that stands in the code; makes nothing.
Ref<String> accessibilityLocalizedString(std::string_view key);

}  // namespace ax
