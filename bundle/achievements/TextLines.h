#pragma once

#include "platform/toolkit/Label.h"

namespace ax {

// The lines of a text joined as parts of one label.
Ref<String> labelForLines(const String& text);

}  // namespace ax
