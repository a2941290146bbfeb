#pragma once

#include <initializer_list>
#include <optional>
#include <span>

#include "platform/accessibility/ValidationManager.h"
#include "platform/runtime/KeyReading.h"
#include "platform/runtime/SafeCategory.h"

namespace ax {

// Makes the runtime classes of a category: "<name>", which derives from the empty "__<name>_super", which
// derives from "SafeCategory". Nothing is installed by it.
Class& registerCategory(std::string_view name, std::string_view targetClassName,
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
    category = &registerCategory(name, targetClassName, &C::_accessibilityPerformValidations,
                                 {overrides.begin(), overrides.size()});
  }

  static inline Class* category = nullptr;
};

// The entry through which an object is seen as a category, or null, reported as a cast mismatch, when it is
// no instance of the class onto which that category was grafted.
const Method* safeCategoryEntry(const Class* category, Receiver object, bool* mismatch, SourcePlace place);

// The object seen through a category's own methods; the view must not outlive it.
template <class C>
std::optional<C> castAsSafeCategory(Receiver object, bool* mismatch = nullptr,
                                    SourcePlace place = SourcePlace::current()) {
  const Method* entry = safeCategoryEntry(CategoryRegistration<C>::category, object, mismatch, place);
  return entry == nullptr ? std::nullopt : std::optional<C>(std::in_place, *object.get(), *entry);
}

// What a category class says of itself.
std::string categoryTargetClassName(Class& category);
void performCategoryValidations(Class& category, Ref<ValidationManager> manager);

}  // namespace ax
