#pragma once

// What the source file of a category needs.
#include "bundle/core/InstallationList.h"
#include "bundle/core/StandardOverrides.h"
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

template <class C>
constexpr auto validationsOf() -> void (*)(const Contract&) {
  if constexpr (requires { &C::_accessibilityPerformValidations; }) {
    return &C::_accessibilityPerformValidations;
  } else {
    return nullptr;
  }
}

}  // namespace ax

// Stands at the end of a category's source file, in namespace ax: the class by which the category is named,
// the host's class that it is for, and rows for the methods that answer messages of the host. In these rows C
// is the category.
//
//   AX_CATEGORY(ChartDetailCellAccessibility, "ChartDetailCell",
//               overrides<&C::addChartLabelWithUnit>(ax::addChartLabelWithUnit))
#define AX_CATEGORY(Name, target, ...)                                                                  \
  template <>                                                                                           \
  const CategoryRecord& categoryAt<placeInInstallationList(#Name)>() {                                  \
    using C = Name;                                                                                     \
    static constexpr OverrideList all = overridesOf<C>({__VA_ARGS__});                                  \
    static constexpr auto rows = firstRows<all.count>(all);                                             \
    static constexpr InstallationRow row = installationList[placeInInstallationList(#Name)];            \
    static constexpr CategoryRecord record{row.category, target, row.screen, validationsOf<C>(), rows}; \
    return record;                                                                                      \
  }
