#pragma once

#include "platform/toolkit/View.h"

namespace ax::reader {

// Turns the frames within a screen, a view or a controller, around: what stood at the left of its view stands
// at the right. What has no frame yet is left to the host's layout, and so are pages, which follow one
// another in their own order. Main thread only.
void mirror(const Ref<Object>& screen);

}  // namespace ax::reader
