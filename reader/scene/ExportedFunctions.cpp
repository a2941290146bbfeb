#include "reader/scene/ExportedFunctions.h"

#include "platform/foundation/AttributedString.h"
#include "platform/foundation/Date.h"
#include "platform/health/Unit.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::reader {

namespace {

template <class Type>
struct Row;
template <class R, class... A>
struct Row<R(A...)> {
  static Ref<Object> call(void* function, std::span<const Ref<Object>> arguments) {
    return callIndexed(reinterpret_cast<R (*)(A...)>(function), arguments, std::index_sequence_for<A...>());
  }
  template <std::size_t... I>
  static Ref<Object> callIndexed(R (*function)(A...), std::span<const Ref<Object>> arguments,
                                 std::index_sequence<I...>) {
    return box(function(unbox<std::remove_cvref_t<A>>(arguments[I])...));
  }
  static ExportedFunction make(std::string_view name) {
    return {name,
            {encodingOf<R>(), encodingOf<std::remove_cvref_t<A>>()...},
            &registration::takesArguments<A...>,
            &call};
  }
};

const std::vector<ExportedFunction>& functions() {
  static const auto* const rows = new std::vector<ExportedFunction>{
      Row<Ref<String>(const Ref<String>&)>::make("accessibilityLocalizedString"),
      Row<Ref<String>(const Ref<Object>&)>::make("accessibilityLocalizedStringForAchievement"),
      Row<Ref<String>(double, double, double, bool)>::make("accessibilityDescriptionForPercentages"),
      Row<std::int64_t(const Ref<Date>&)>::make("CHCacheIndexForDate"),
      Row<Ref<String>(const Ref<Date>&, bool)>::make("accessibilityVeltoStringForDate"),
      Row<Ref<Unit>(std::uint64_t)>::make("accessibilityQSUnitForTrendType"),
      Row<Ref<AccessibilityAttributedString>(const Ref<String>&)>::make(
          "accessibilityAttributedStringForPaceContainingString"),
  };
  return *rows;
}

}  // namespace

const ExportedFunction* exportedFunction(std::string_view name) {
  for (const ExportedFunction& function : functions()) {
    if (function.name == name) return &function;
  }
  return nullptr;
}

std::string exportedNames() {
  std::string names;
  for (const ExportedFunction& function : functions()) {
    names.append(names.empty() ? "" : ", ").append(function.name);
  }
  return names;
}

}  // namespace ax::reader
