#pragma once

#include <functional>

#include "platform/toolkit/View.h"

namespace ax::reader {

// Whether the scene itself gave an object its frame.
using PlacedTest = std::function<bool(const Object&)>;

// Turns the frames within a screen, a view or a controller, around: what stood at the left of its view stands
// at the right. What the scene did not place is left to the host's layout, which knows the direction; pages
// follow one another in their own order, and views that do not change sides stay where they are, with their
// parts. Main thread only.
void mirror(const Ref<Object>& screen, const PlacedTest& isPlaced);

}  // namespace ax::reader
