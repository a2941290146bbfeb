#pragma once

#include <optional>
#include <span>

#include "platform/accessibility/Contract.h"
#include "platform/runtime/KeyReading.h"
#include "platform/runtime/SafeCategory.h"

namespace ax {

// All that makes a category, as constant data. It lives as long as the process.
struct CategoryRecord {
  std::string_view name;
  std::string_view targetClassName;
  std::string_view screen;                         // what it speaks for, such as "Workout detail"
  void (*validations)(const Contract&) = nullptr;  // null: it relies on nothing but its target
  std::span<const Override> overrides = {};
};

// Makes the runtime classes of a category: "<name>", which derives from the empty "__<name>_super", which
// derives from "SafeCategory". Nothing is installed by it.
Class& registerCategory(const CategoryRecord& record);

// The entry through which an object is seen as a category, or null, reported as a cast mismatch, when it is
// no instance of the class onto which that category was grafted.
const Method* safeCategoryEntry(Selector category, Receiver object, bool* mismatch, SourcePlace place);

// The object seen through a category's own methods; the view must not outlive it. The category is named by a
// literal: castAsSafeCategory<LoadingViewAccessibility>("LoadingViewAccessibility"_key, view).
template <class C>
std::optional<C> castAsSafeCategory(Selector category, Receiver object, bool* mismatch = nullptr,
                                    SourcePlace place = SourcePlace::current()) {
  const Method* entry = safeCategoryEntry(category, object, mismatch, place);
  return entry == nullptr ? std::nullopt : std::optional<C>(seenAs<C>(*object.get(), *entry));
}

// What a category class says of itself; empty for a class that is none.
std::string categoryTargetClassName(Class& category);
std::string categoryScreen(Class& category);
void performCategoryValidations(Class& category, Ref<ValidationManager> manager);

}  // namespace ax
