#pragma once

// What the source file of a category needs.
#include "platform/accessibility/CategoryRegistration.h"
#include "platform/foundation/Array.h"
#include "platform/foundation/String.h"
#include "platform/runtime/KeyReading.h"
#include "platform/runtime/SafeCategory.h"
#include "platform/toolkit/AccessibilityElement.h"
#include "platform/toolkit/AccessibilityMessages.h"
#include "platform/toolkit/AccessibilityProperties.h"
#include "platform/toolkit/ElementTree.h"
#include "platform/toolkit/SpokenText.h"
#include "platform/toolkit/ToolkitMessages.h"

namespace ax {

using Manager = ValidationManager;

}  // namespace ax
