#pragma once

#include "bundle/core/Category.h"
#include "bundle/shared/LocalizedString.h"

namespace ax {

// Names the right button of a controller's navigation item, which the host shows as a picture.
inline void labelTodayButton(Object& controller) {
  const Ref<Object> item = controller.safeValueForKey("navigationItem"_key);
  messages::setAccessibilityLabel(safeValueForKey(item, "rightBarButtonItem"_key),
                                  accessibilityLocalizedString("today"));
}

}  // namespace ax
