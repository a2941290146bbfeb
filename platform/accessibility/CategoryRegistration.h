#pragma once

#include <initializer_list>
#include <span>

#include "platform/accessibility/ValidationManager.h"
#include "platform/runtime/SafeCategory.h"

namespace ax {

// Makes the runtime classes of a category: "<name>", which derives from the empty "__<name>_super", which
// derives from "SafeCategory". Nothing is installed by it.
void registerCategory(std::string_view name, std::string_view targetClassName,
                      void (*validations)(ValidationManager&), std::span<const Override> overrides);

// Stands at the end of a category's source file:
//
//   static const CategoryRegistration<LoadingViewAccessibility> registration{
//       "LoadingViewAccessibility", "LoadingView",
//       {overrides<&LoadingViewAccessibility::accessibilityViewIsModal>(messages::accessibilityViewIsModal)}};
template <class C>
struct CategoryRegistration {
  CategoryRegistration(std::string_view name, std::string_view targetClassName,
                       std::initializer_list<Override> overrides) {
    registerCategory(name, targetClassName, &C::_accessibilityPerformValidations,
                     {overrides.begin(), overrides.size()});
  }
};

// What a category class says of itself.
std::string categoryTargetClassName(Class& category);
void performCategoryValidations(Class& category, Ref<ValidationManager> manager);

}  // namespace ax
