#pragma once

#include "bundle/core/Export.h"
#include "platform/foundation/AttributedString.h"

// A text with a pace such as 5'30" in it, its first pace written as a number of seconds that is marked to be
// spoken as minutes and seconds. A text that marks missing data with dashes becomes the words for no data,
// one without a pace stays as it is, and nil or an empty one gives nil. Main thread only.
AX_EXPORT ax::Ref<ax::AccessibilityAttributedString> accessibilityAttributedStringForPaceContainingString(
    const ax::Ref<ax::String>& string);

namespace ax {

// Whether a text shows dashes where a value is missing.
bool marksMissingData(const String& text);

}  // namespace ax
